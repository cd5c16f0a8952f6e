// The presentation application. Its scripts spell its identifier in another case than the one it runs under.
#pragma once

#include <cstdint>

/// Acts on a button by what the application shows: its slide switcher, a slideshow, or neither. The value
/// counts for Fast Forward and Rewind alone, which jump when it is greater than zero. True when the button is
/// one of the mode's.
bool SlidewellHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

void SlidewellCommand_ToggleFreeze();
void SlidewellCommand_SlideSwitcherBackward();
void SlidewellCommand_SlideSwitcherForward();
void SlidewellCommand_AcceptSlideSwitcher();
void SlidewellCommand_CancelSlideSwitcher();
void SlidewellCommand_ShowSlideSwitcher();
void SlidewellCommand_JumpToEnd();
void SlidewellCommand_JumpToStart();
void SlidewellCommand_PreviousSlide();
void SlidewellCommand_NextSlide();
void SlidewellCommand_StopPresentation();
/// Nothing in the daemon calls it.
void SlidewellCommand_Activate();
/// Silences every other application first.
void SlidewellCommand_StartPresentation();

/// Whether the slide switcher shows; false when the application does not answer.
bool Slidewell_SlideSwitcherVisible();
/// Whether a slideshow plays; false when the application does not answer.
bool Slidewell_IsPlaying();
