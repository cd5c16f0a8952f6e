#include "platform/linux/programs/own_words.h"

namespace linux::programs::words {

namespace {

struct KeyWord {
  Code word;
  std::uint16_t virtualKey;
  bool withShift;
};

constexpr KeyWord kKeyWords[] = {
    {kShiftS, 1, true},
    {kReturn, 36, false},
    {kSpace, 49, false},
    {kEscape, 53, false},
};

}  // namespace

Code wordForKey(std::uint16_t virtualKey, bool withShift) {
  for (const KeyWord& row : kKeyWords) {
    if (row.virtualKey == virtualKey && row.withShift == withShift) return row.word;
  }
  return 0;
}

}  // namespace linux::programs::words
