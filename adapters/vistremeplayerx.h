// The modern movie player.
#pragma once

#include <cstdint>

/// Acts on a button; the value is non-zero when it was pressed. True when the button counts as one of the
/// modern movie player's; the two that climb the ladder of scan rates do not.
bool VistremePlayerXHandleHIDEvent(std::uint32_t usagePage, std::uint32_t usage, std::int32_t value);

/// Does nothing: the player has no such command.
void VistremeXCommand_FullScreenMode();
/// One sixteenth of the front document's volume down. Nothing in the daemon calls it.
void VistremeXCommand_VolumeDown();
/// One sixteenth of the front document's volume up.
void VistremeXCommand_VolumeUp();
void VistremeXCommand_NextTrack();
/// One step on the backward or forward ladder of scan rates.
void VistremeXCommand_Left();
void VistremeXCommand_Right();
/// Plays on or stands still, as remembered. Nothing in the daemon calls it, nor the next but one.
void VistremeXCommand_Resume();
void VistremeXCommand_Stop();
void VistremeXCommand_Activate();
void VistremeXCommand_Pause();
void VistremeXCommand_Play();
/// Steps back and plays on if the document played.
void VistremeXCommand_BackTrack();
/// Starts a scan or climbs its ladder; released, only asks for the rate.
void VistremeXCommand_Rewind(bool pressed);
void VistremeXCommand_FastForward(bool pressed);
/// Toggles play; during a scan goes back to what was before it.
void VistremeXCommand_PlayOrPause();

/// Whether the front document plays; false when it does not answer.
bool VistremePlayerX_IsPlaying();
/// The front document's rate without its fraction; 0 when it does not answer.
std::int32_t VistremePlayerX_GetScanRate();
/// The front document's volume in percent of the classic player's scale; 0 when it does not answer.
std::int32_t VistremePlayerX_GetVolume();
