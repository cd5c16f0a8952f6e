#include "platform/linux/players/program_channel.h"

#include "platform/linux/players/mpv.h"
#include "platform/linux/players/vlc.h"

namespace linux::players {

const ProgramChannel* channelOf(ChannelKind kind) {
  switch (kind) {
    case ChannelKind::Mpv:
      return &kMpvChannel;
    case ChannelKind::VlcRc:
      return &kVlcChannel;
    case ChannelKind::None:
      break;
  }
  return nullptr;
}

}  // namespace linux::players
