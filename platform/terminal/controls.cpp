#include "platform/terminal/controls.h"

#include <algorithm>
#include <cstdlib>
#include <utility>

#include "daemon/kvd.h"
#include "platform/stage/desktop.h"
#include "platform/stage/director.h"
#include "platform/terminal/catalogue.h"
#include "platform/text/utf8.h"

namespace terminal {

namespace {

std::string narrow(std::wstring_view wide) {
  std::string text;
  for (const wchar_t character : wide) text::appendUTF8(text, static_cast<char32_t>(character));
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

const stage::Application* numbered(const Keypress& key) {
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

/// From obeying to errors, to silence, and back.
std::string_view nextManner(stage::Manner manner) {
  switch (manner) {
    case stage::Manner::Obeys:
      return " errors";
    case stage::Manner::Refuses:
      return " nothing";
    case stage::Manner::Ignores:
      break;
  }
  return " normally";
}

void takeDigit(State& state, const Keypress& key) {
  const Pending pending = std::exchange(state.pending, Pending::Nothing);
  const auto* const application = numbered(key);
  if (application == nullptr) return;
  const std::string word = wordFor(*application);
  if (pending == Pending::Close) return perform(state, "close " + word);
  perform(state, "answers " + word + std::string(nextManner(application->manner)));
}

/// One version of each generation that kvd tells apart.
constexpr const char* kLibraryVersions[] = {"6.0.6", "7.1.5", "8.1.2"};

void changeLibraryVersion(State& state) {
  const auto* const library = applicationOf(App::Snap);
  if (library == nullptr) return;
  const int generation = std::atoi(library->version.c_str());
  const auto* const next = std::ranges::find_if(
      kLibraryVersions, [&](const char* version) { return std::atoi(version) > generation; });
  perform(state, "version " + wordFor(*library) + " " +
                     (next != std::end(kLibraryVersions) ? *next : kLibraryVersions[0]));
}

void captureDisplay(State& state) {
  const auto& displays = stage::desktop().displays;
  const bool captured = !displays.empty() && displays.front().capturedByHand;
  perform(state, captured ? "capture 1 off" : "capture 1 on");
}

// ---- The command line ----

void runTyped(State& state) {
  const std::wstring typed = *std::exchange(state.commandLine, std::nullopt);
  if (typed.empty()) return;
  state.history.push_back(typed);
  perform(state, narrow(typed));
}

/// Goes through the commands typed before; behind the last of them the line is empty.
void recall(State& state, std::size_t which) {
  if (which > state.history.size()) return;
  state.recalled = which;
  state.commandLine = which < state.history.size() ? state.history[which] : std::wstring();
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
      return recall(state, state.recalled - 1);
    case Special::Down:
      return recall(state, state.recalled + 1);
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
      state.pending = Pending::Close;
      return;
    case L'e':
      state.pending = Pending::Fail;
      return;
    case L'l':
      return perform(state, gScreenLocked ? "lock off" : "lock on");
    case L'c':
      return captureDisplay(state);
    case L'v':
      return changeLibraryVersion(state);
    case L's':
      state.wholeScripts = !state.wholeScripts;
      return;
    case L':':
      state.commandLine.emplace();
      state.recalled = state.history.size();
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
  const bool keepsPlace = key.character == L's' && !state.showsHelp && !state.commandLine;
  if (!keepsPlace) state.scrolled = 0;
  if (std::exchange(state.showsHelp, false) && key.character != L'q') return;
  if (state.commandLine) return typeCommand(state, key);
  if (state.pending != Pending::Nothing) return takeDigit(state, key);
  if (const RemoteKey* const remote = findRemoteKey(key)) return useRemote(state, *remote);
  if (const auto* const application = numbered(key)) return openOrBringToFront(state, *application);
  useLetter(state, key.character);
}

}  // namespace terminal
