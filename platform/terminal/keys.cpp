#include "platform/terminal/keys.h"

#include <algorithm>
#include <array>

namespace terminal {

namespace {

constexpr auto kRemoteKeys = std::to_array<RemoteKey>({
    {{0, Special::Up}, L"↑", "up", L"up"},
    {{L' '}, L"Space", "playpause", L"Play/Pause"},
    {{L'+'}, L"+", "volume-up", L"louder", true},
    {{0, Special::Down}, L"↓", "down", L"down"},
    {{L'p'}, L"p", "previous", L"previous"},
    {{L'-'}, L"-", "volume-down", L"quieter", true},
    {{0, Special::Left}, L"←", "left", L"left"},
    {{L'n'}, L"n", "next", L"next"},
    {{L'm'}, L"m", "app-menu", L"app menu"},
    {{0, Special::Right}, L"→", "right", L"right"},
    {{L'r'}, L"r", "rewind", L"rewind", true},
    {{0, Special::Escape}, L"Esc", "menu", L"menu"},
    {{0, Special::Enter}, L"Enter", "select", L"select"},
    {{L'f'}, L"f", "forward", L"forward", true},
    {{L'.'}, L".", "stop", L"stop"},
});

constexpr auto kOtherKeys = std::to_array<OtherKey>({
    {L"1-9", L"open/front"},
    {L"x", L"close one"},
    {L"e", L"fail one"},
    {L"0", L"no front"},
    {L"l", L"lock screen"},
    {L"c", L"capture"},
    {L"v", L"version"},
    {L"s", L"scripts"},
    {L":", L"command"},
    {L"PgUp", L"look back"},
    {L"?", L"all keys"},
    {L"q", L"quit"},
});

}  // namespace

std::span<const RemoteKey> remoteKeys() { return kRemoteKeys; }

const RemoteKey* findRemoteKey(const Keypress& key) {
  const auto* const found = std::ranges::find(kRemoteKeys, key, &RemoteKey::key);
  return found != kRemoteKeys.end() ? found : nullptr;
}

std::span<const OtherKey> otherKeys() { return kOtherKeys; }

}  // namespace terminal
