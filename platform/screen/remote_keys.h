// The remote control on the keyboard.
#pragma once

#include <span>
#include <string_view>

#include "platform/screen/keypress.h"

namespace live {

struct RemoteKey {
  Keypress key;
  std::wstring_view label;  ///< the key, for people
  std::string_view button;  ///< its name among the buttons of the remote
  std::wstring_view what;   ///< the button, for people
  /// A terminal does not tell when a key comes up: the first press holds the button down, the second lets it
  /// go.
  bool toggles = false;
};

/// Every key, in the order to show them in rows of two.
std::span<const RemoteKey> remoteKeys();
inline constexpr int kKeysPerRow = 2;
/// The room that the rows take.
inline constexpr int kRemoteColumns = 31;

/// The button's key, null when the key stands for none.
const RemoteKey* findRemoteKey(const Keypress& key);

}  // namespace live
