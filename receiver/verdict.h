// Which input devices are remotes, and why.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "receiver/keymap.h"

namespace receiver {

/// Why a device is a remote, or is none.
enum class Verdict {
  Infrared,
  CEC,
  AVRCP,
  Marked,
  Named,
  Alone,
  NoButtons,
  Virtual,
  Keyboard,
  Mouse,
  BesideKeyboard,
  BesideMouse,
  BesideSound,
};

/// Whether such a device is a remote.
bool isRemote(Verdict verdict);

/// The reason in words, for people.
std::string_view reason(Verdict verdict);

/// An input device as udev tells it.
struct Node {
  /// /dev/input/eventN.
  std::string path;
  std::string name;
  /// Who made it and what it is, as udev rules say it: four hexadecimal digits each.
  std::string vendor;
  std::string product;
  Road road = Road::HID;
  /// The physical device that it belongs to, with others perhaps; empty for those of no USB or Bluetooth
  /// device.
  std::string physical;
  /// All the keys (KEY_…) that it can send.
  std::vector<std::uint16_t> keys;
  bool keyboard = false;
  bool mouse = false;
  /// A sound card belongs to the same physical device.
  bool sound = false;
  /// udev says that it is a remote (ID_REMOTE_CONTROL=1).
  bool marked = false;
  /// The command line says so.
  bool named = false;

  /// What judge() finds.
  Verdict verdict = Verdict::NoButtons;
  /// This node, or a remote beside it on the same physical device, has keys for the volume.
  bool volumeKeys = false;
};

/// Settles verdict and volumeKeys of all nodes, which takes all: what lies beside a node says what it is.
void judge(std::vector<Node>& nodes);

}  // namespace receiver
