#include "platform/linux/own_words.h"

#include "platform/host.h"

namespace desktop {

namespace {

struct KeyWord {
  tarnscript::Code word;
  std::uint16_t virtualKey;
  bool withShift;
};

constexpr KeyWord kKeyWords[] = {
    {words::kShiftS, HostVirtualKey::S, true},
    {words::kReturn, HostVirtualKey::Return, false},
    {words::kSpace, HostVirtualKey::Space, false},
    {words::kEscape, HostVirtualKey::Escape, false},
};

struct Name {
  tarnscript::Code word;
  const char* name;
};

constexpr Name kNames[] = {
    {words::kShiftS, "key Shift+S"},
    {words::kReturn, "key Return"},
    {words::kSpace, "key Space"},
    {words::kEscape, "key Escape"},
    {words::kCommandEscape, "key Command+Escape"},
    {words::kNextAlbum, "`select` the next album"},
    {words::kPreviousAlbum, "`select` the previous album"},
};

}  // namespace

tarnscript::Code wordForKey(std::uint16_t virtualKey, bool withShift) {
  for (const KeyWord& row : kKeyWords) {
    if (row.virtualKey == virtualKey && row.withShift == withShift) return row.word;
  }
  return 0;
}

const char* nameOfOwnWord(tarnscript::Code word) {
  for (const Name& row : kNames) {
    if (row.word == word) return row.name;
  }
  return nullptr;
}

}  // namespace desktop
