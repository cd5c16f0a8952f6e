// The classic movie player. Its scripts spell its identifier in another case than the one it runs under.
#pragma once

#include <cstdint>

/// Acts on a button; the value is non-zero when it was pressed. True when the button is one of the classic
/// movie player's.
bool VistremePlayerHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

/// One sixteenth of the front movie's volume down. Nothing in the daemon calls it.
void VistremeCommand_VolumeDown();
/// One sixteenth of the front movie's volume up.
void VistremeCommand_VolumeUp();
void VistremeCommand_BackTrack();
void VistremeCommand_NextTrack();
/// Ends a scan as it began: playing or standing still.
void VistremeCommand_Resume();
void VistremeCommand_Stop();
void VistremeCommand_Pause();
void VistremeCommand_PlayOrPause();
/// The three below have no caller in the daemon.
void VistremeCommand_Play();
void VistremeCommand_FullScreenMode();
void VistremeCommand_Activate();
/// Starts a scan; released, ends it as it began.
void VistremeCommand_Rewind(bool pressed);
void VistremeCommand_FastForward(bool pressed);

/// Whether the front movie plays; false when it does not answer.
bool VistremePlayer_IsPlaying();
/// The front movie's volume in percent; 0 when it does not answer.
std::int32_t VistremePlayer_GetVolume();
