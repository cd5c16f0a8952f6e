#include "tests/linux/fake_windows.h"

#include <algorithm>
#include <utility>

#include "platform/linux/windows/keysyms.h"
#include "platform/linux/windows/none.h"
#include "remote/words.h"

namespace fake {

namespace {

using namespace linux::windows;

void look(std::span<Window> windows) {
  if (screen().callFails()) return;
  for (Window& looked : windows) {
    const auto now = std::ranges::find(screen().windows, looked.id, &Window::id);
    if (now != screen().windows.end()) looked = *now;
  }
}

bool tell(std::uint64_t number, const std::string& text) {
  const auto found = std::ranges::find(screen().windows, ID{&kWindows, number}, &Window::id);
  if (found == screen().windows.end() || screen().callFails()) return false;
  screen().journal("window " + found->title + ": " + text);
  return true;
}

bool takeKey(std::uint64_t number, std::uint32_t keysym, bool down, Modifiers modifiers) {
  std::string name(1, static_cast<char>(keysym));
  for (const char* known :
       {"space", "Return", "Escape", "Left", "Right", "Up", "Down", "Home", "End", "F5", "F9", "F11"}) {
    if (parseKey(known)->keysym == keysym) name = known;
  }
  if ((modifiers & kShift) != 0) name.insert(0, "Shift+");
  if ((modifiers & kControl) != 0) name.insert(0, "Control+");
  return tell(number, "key " + name + (down ? " down" : " up"));
}

Backend makeBackend() {
  Backend backend = kNone;
  backend.open = [] { return true; };
  backend.takeIn = [] { return std::exchange(screen().changed, false); };
  backend.list = []() -> const std::vector<Window>& {
    static const std::vector<Window> none;
    return screen().callFails() ? none : screen().windows;
  };
  backend.look = look;
  backend.knowsFront = [] { return !screen().callFails() && screen().knowsFront; };
  backend.reach = [] { return screen().reach; };
  backend.activate = [](std::uint64_t number) { tell(number, "activate"); };
  backend.sendKey = takeKey;
  backend.outputs = [] { return screen().outputs; };
  return backend;
}

}  // namespace

const Backend kWindows = makeBackend();

Screen& screen() {
  static Screen screen;
  return screen;
}

Window& openWindow(const std::string& title, pid_t process, const std::string& busName) {
  static std::uint64_t last = 0;
  Window& opened = *screen().windows.emplace(screen().windows.begin());
  opened.id = {&kWindows, ++last};
  opened.process = process;
  opened.title = title;
  opened.isShown = true;
  opened.area = screen().outputs.front().area;
  opened.gtk = {busName, "/app", "/win/" + title};
  screen().changed = true;
  return opened;
}

Window& window(const std::string& title) {
  const auto found = std::ranges::find(screen().windows, title, &Window::title);
  if (found == screen().windows.end())
    throw remote::UsageError("no window is called " + remote::inQuotes(title));
  return *found;
}

}  // namespace fake
