#include "platform/linux/roles/posted_keys.h"

#include "platform/linux/roles/deeds.h"
#include "platform/linux/windows/keystrokes.h"
#include "platform/linux/windows/keysyms.h"
#include "platform/linux/roles/own_words.h"

namespace desktop {

namespace {

/// Does what the program's row for the key says. False when it has none, or one whose way is not open.
bool doneOtherwise(const Instance& instance, std::uint16_t virtualKey, std::uint16_t modifiers) {
  const tarnscript::Code word = wordForKey(virtualKey, (modifiers & kShift) != 0);
  if (word == 0) return false;
  try {
    perform(instance, word);
    return true;
  } catch (const tarnscript::Refusal&) {
    return false;
  }
}

}  // namespace

Window pressKey(const Instance& instance, std::uint16_t virtualKey, std::uint16_t modifiers) {
  if (doneOtherwise(instance, virtualKey, modifiers)) return 0;
  const std::uint32_t keysym = keysymOf(virtualKey);
  const Window window = keyboardWindow(instance);
  return keysym != 0 && sendKey(window, keysym, true, modifiers) ? window : 0;
}

void releaseKey(Window window, std::uint16_t virtualKey, std::uint16_t modifiers) {
  if (window != 0) sendKey(window, keysymOf(virtualKey), false, modifiers);
}

}  // namespace desktop
