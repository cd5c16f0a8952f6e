// What the keyboard does, for the parts of the screen that tell it and for those that do it.
#pragma once

#include <span>
#include <string_view>

#include "platform/terminal/keypress.h"

namespace terminal {

/// A key that is a button of the remote.
struct RemoteKey {
  Keypress key;
  std::wstring_view label;  ///< the key, for people
  std::string_view button;  ///< its name among the buttons of the remote
  std::wstring_view what;   ///< the button, for people
  /// A terminal does not tell when a key comes up: the first stroke presses the button, the second lets it
  /// go.
  bool toggles = false;
};

/// The keys of the remote, in the order in which they are shown, from left to right.
std::span<const RemoteKey> remoteKeys();
/// The button's key, null when the key stands for none.
const RemoteKey* findRemoteKey(const Keypress& key);

/// A key that does something else, in short.
struct OtherKey {
  std::wstring_view label;
  std::wstring_view what;
};
std::span<const OtherKey> otherKeys();

/// Both kinds are shown in rows of so many.
inline constexpr int kKeysPerRow = 3;

}  // namespace terminal
