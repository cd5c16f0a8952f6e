// The disc player.
//
// Two layers: dispatchToSpindle takes the buttons whose meaning depends on whether a disc menu shows, and the
// volume buttons; SpindleHandleHIDEvent has the table of all others.
#pragma once

#include <cstdint>

#include "daemon/kvd.h"

/// Acts on a whole event, extra field included; the value is non-zero when the button was pressed. True when
/// the button is one of the disc player's.
bool dispatchToSpindle(PackedHIDEvent event, std::int32_t value);
/// The same for the buttons that dispatchToSpindle does not take itself.
bool SpindleHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

/// The plain scan of a disc menu; released, nothing.
void DVDCommand_AmbiguousFastForward(bool pressed);
void DVDCommand_AmbiguousRewind(bool pressed);
/// Unmutes the player's own audio.
void DVDCommand_Unmute();
/// One sixteenth of the player's own volume down. Nothing in the daemon calls it.
void DVDCommand_VolumeDown();
/// One sixteenth of the player's own volume up.
void DVDCommand_VolumeUp();
/// The chapter before, the start of the first one, or the main menu.
void DVDCommand_BackTrack();
/// The next chapter, or the main menu behind the last one.
void DVDCommand_NextTrack();
/// Ends a scan as it began: paused or playing.
void DVDCommand_Resume();
/// From a menu back to the film.
void DVDCommand_ResumePlaying();
void DVDCommand_Stop();
void DVDCommand_Pause();
void DVDCommand_HideController();
void DVDCommand_SetSubtitles(bool on);
void DVDCommand_FullScreenMode();
void DVDCommand_MenuRight();
void DVDCommand_MenuLeft();
void DVDCommand_MenuDown();
void DVDCommand_MenuUp();
void DVDCommand_Activate();
/// The four below silence every other application first.
void DVDCommand_PlayFromBeginning();
void DVDCommand_PlayOrPause();
void DVDCommand_Play();
void DVDCommand_Select();
/// A step in a menu, else the next or the last chapter.
void DVDCommand_AmbiguousRightArrow();
void DVDCommand_AmbiguousLeftArrow();
/// Opens the disc menu, or leaves it for the film; silences every other application first.
void DVDCommand_DVDMenu();
/// Starts a scan; released, ends it as it began.
void DVDCommand_Rewind(bool pressed);
void DVDCommand_FastForward(bool pressed);

bool Spindle_DisplayingSubtitles();
bool Spindle_HasMedia();
/// Whether a disc menu shows; false when the player does not answer, like all queries of this family.
bool Spindle_AtMenu();
/// The player's own volume in percent.
std::int32_t Spindle_GetVolume();
FourCharCode Spindle_GetPlayerState();
bool Spindle_IsPaused();
bool Spindle_IsPlaying();
FourCharCode Spindle_GetActiveMenu();
