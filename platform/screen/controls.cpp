#include "platform/screen/controls.h"

#include <algorithm>
#include <utility>

#include "daemon/kvd.h"
#include "platform/base/utf8.h"
#include "platform/screen/catalogue.h"
#include "platform/stage/desktop.h"
#include "platform/stage/director.h"

namespace live {

namespace {

std::string narrow(std::wstring_view wide) {
  std::string text;
  for (const wchar_t character : wide) base::appendUTF8(text, static_cast<char32_t>(character));
  return text;
}

void perform(State& state, const std::string& command) {
  state.journal.addCommand(command);
  stage::performCommand(command);
}

// ---- The remote ----

void releaseHeld(State& state) {
  const RemoteKey* const held = std::exchange(state.held, nullptr);
  perform(state, "release " + std::string(held->button));
}

/// A person has one thumb: a button that is held comes up before another goes down.
void useRemote(State& state, const RemoteKey& key) {
  const bool wasHeld = state.held == &key;
  if (state.held != nullptr) releaseHeld(state);
  if (wasHeld) return;
  if (key.toggles) state.held = &key;
  perform(state, (key.toggles ? "press " : "tap ") + std::string(key.button));
}

// ---- The applications ----

const stage::Application* applicationOf(const Keypress& key) {
  if (key.character < L'1' || key.character > L'9') return nullptr;
  const auto applications = openable(stage::desktop());
  const auto index = static_cast<std::size_t>(key.character - L'1');
  return index < applications.size() ? applications[index] : nullptr;
}

/// What commands call it.
std::string wordFor(const stage::Application& application) {
  return stage::findApplication(application.name) == &application ? application.name : application.identifier;
}

void openOrBringToFront(State& state, const stage::Application& application) {
  perform(state, (application.running() ? "front " : "open ") + wordFor(application));
}

void closeApplication(State& state, const Keypress& key) {
  state.closing = false;
  if (const auto* const application = applicationOf(key)) perform(state, "close " + wordFor(*application));
}

// ---- The command line ----

void runTyped(State& state) {
  const std::wstring typed = *std::exchange(state.commandLine, std::nullopt);
  if (typed.empty()) return;
  state.lastCommand = typed;
  perform(state, narrow(typed));
}

void typeCommand(State& state, const Keypress& key) {
  /// A command of this length is a slip of the clipboard.
  constexpr std::size_t kLongestCommand = 4096;
  std::wstring& line = *state.commandLine;
  switch (key.special) {
    case Special::Enter:
      return runTyped(state);
    case Special::Escape:
      return state.commandLine.reset();
    case Special::Backspace:
      if (line.empty()) return state.commandLine.reset();
      return line.pop_back();
    case Special::Up:
      line = state.lastCommand;
      return;
    default:
      if (key.character != 0 && line.size() < kLongestCommand) line += key.character;
  }
}

// ---- The rest ----

void useLetter(State& state, wchar_t letter) {
  switch (letter) {
    case L'0':
      return perform(state, "front nobody");
    case L'x':
      state.closing = true;
      return;
    case L'l':
      return perform(state, gScreenLocked ? "lock off" : "lock on");
    case L':':
      state.commandLine.emplace();
      return;
    case L'?':
      state.showsHelp = true;
      return;
    case L'q':
      return perform(state, "quit");
    default:
      return;
  }
}

/// True when the key was for looking around.
bool scroll(State& state, const Keypress& key) {
  const int direction = key.special == Special::PageUp ? 1 : key.special == Special::PageDown ? -1 : 0;
  const int towardsTop = state.showsHelp ? -direction : direction;
  state.scrolled = std::max(0, state.scrolled + towardsTop * state.page);
  return direction != 0;
}

}  // namespace

void handle(State& state, const Keypress& key) {
  if (scroll(state, key)) return;
  state.scrolled = 0;
  if (std::exchange(state.showsHelp, false) && key.character != L'q') return;
  if (state.commandLine) return typeCommand(state, key);
  if (state.closing) return closeApplication(state, key);
  if (const RemoteKey* const remote = findRemoteKey(key)) return useRemote(state, *remote);
  if (const auto* const application = applicationOf(key)) return openOrBringToFront(state, *application);
  useLetter(state, key.character);
}

}  // namespace live
