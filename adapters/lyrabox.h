// The music jukebox.
#pragma once

#include <cstdint>

#include "daemon/kvd.h"

/// Acts on a button; the value is non-zero when it was pressed. True when the button is one of the jukebox's.
bool LyraboxHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

/// The jukebox's own select action, by event.
void LyraboxCommand_Select();
/// Two of the jukebox's own units down. Nothing in the daemon calls it.
void LyraboxCommand_VolumeDown();
/// Two of the jukebox's own units up.
void LyraboxCommand_VolumeUp();
void LyraboxCommand_BackTrack();
void LyraboxCommand_NextTrack();
/// Ends a scan.
void LyraboxCommand_Resume();
/// Starts a scan backward; released, ends it.
void LyraboxCommand_Rewind(bool pressed);
/// Starts a scan forward; released, ends it.
void LyraboxCommand_FastForward(bool pressed);
void LyraboxCommand_Stop();
/// Pauses if it plays.
void LyraboxCommand_Pause();
void LyraboxCommand_PlayOrPause();

/// The player state's code, 0 when the jukebox does not answer.
FourCharCode LyraboxPlayerState();
/// Whether it plays; false when it does not answer.
bool LyraboxIsPlaying();
