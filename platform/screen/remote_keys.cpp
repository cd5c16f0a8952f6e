#include "platform/screen/remote_keys.h"

#include <algorithm>
#include <array>

namespace live {

namespace {

constexpr auto kKeys = std::to_array<RemoteKey>({
    {{0, Special::Up}, L"↑", "up", L"up"},
    {{0, Special::Down}, L"↓", "down", L"down"},
    {{0, Special::Left}, L"←", "left", L"left"},
    {{0, Special::Right}, L"→", "right", L"right"},
    {{L' '}, L"Space", "playpause", L"Play/Pause"},
    {{0, Special::Enter}, L"Enter", "select", L"select"},
    {{L'p'}, L"p", "previous", L"previous"},
    {{L'n'}, L"n", "next", L"next"},
    {{L'r'}, L"r", "rewind", L"rewind", true},
    {{L'f'}, L"f", "forward", L"forward", true},
    {{L'-'}, L"-", "volume-down", L"quieter"},
    {{L'+'}, L"+", "volume-up", L"louder"},
    {{L'm'}, L"m", "menu", L"menu"},
    {{L'a'}, L"a", "app-menu", L"app menu"},
});

}  // namespace

std::span<const RemoteKey> remoteKeys() { return kKeys; }

const RemoteKey* findRemoteKey(const Keypress& key) {
  const auto* const found = std::ranges::find(kKeys, key, &RemoteKey::key);
  return found != kKeys.end() ? found : nullptr;
}

}  // namespace live
