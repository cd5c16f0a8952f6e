#include "platform/linux/roles/posted_keys.h"

#include "platform/linux/programs/own_words.h"
#include "platform/linux/roles/perform.h"
#include "platform/linux/windows/keysyms.h"

namespace linux::roles {

namespace {

/// Does what the program's action for the key says. False when it has none, or one whose way is not open.
bool doneOtherwise(const Performer& performer, std::uint16_t virtualKey, windows::Modifiers modifiers) {
  const bool withShift = (modifiers & windows::kShift) != 0;
  const tarnscript::Code word = programs::words::wordForKey(virtualKey, withShift);
  if (word == 0) return false;
  try {
    perform(performer, word);
    return true;
  } catch (const tarnscript::Refusal&) {
    return false;
  }
}

}  // namespace

windows::ID pressKey(const Performer& performer, std::uint16_t virtualKey, windows::Modifiers modifiers) {
  if (doneOtherwise(performer, virtualKey, modifiers)) return {};
  const std::uint32_t keysym = windows::keysymOf(virtualKey);
  const windows::Window* const window = performer.keyboardWindow();
  if (keysym == 0 || window == nullptr || !windows::sendKey(window->id, keysym, true, modifiers)) return {};
  return window->id;
}

void releaseKey(windows::ID window, std::uint16_t virtualKey, windows::Modifiers modifiers) {
  windows::sendKey(window, windows::keysymOf(virtualKey), false, modifiers);
}

}  // namespace linux::roles
