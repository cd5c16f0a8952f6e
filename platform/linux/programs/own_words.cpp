#include "platform/linux/programs/own_words.h"

#include "platform/host.h"

namespace linux::programs::words {

namespace {

struct KeyWord {
  Code word;
  std::uint16_t virtualKey;
  bool withShift;
};

constexpr KeyWord kKeyWords[] = {
    {kShiftS, HostVirtualKey::S, true},          {kReturn, HostVirtualKey::Return, false},
    {kSpace, HostVirtualKey::Space, false},      {kEscape, HostVirtualKey::Escape, false},
    {kRight, HostVirtualKey::RightArrow, false}, {kLeft, HostVirtualKey::LeftArrow, false},
};

}  // namespace

Code wordForKey(std::uint16_t virtualKey, bool withShift) {
  for (const KeyWord& row : kKeyWords) {
    if (row.virtualKey == virtualKey && row.withShift == withShift) return row.word;
  }
  return 0;
}

}  // namespace linux::programs::words
