// The handler runs in whatever state the program is in: it may call little more than write and tcsetattr, and
// has a stack of its own, for the program's may be what ran out.

#include "platform/terminal/rescue.h"

#include <curses.h>
#include <term.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <csignal>
#include <cstddef>
#include <string>
#include <string_view>

namespace terminal {

namespace {

struct Deadly {
  int signal;
  struct sigaction before;
};

/// The signals that end a program and have no descriptor to arrive at, with what was to happen at them.
std::array<Deadly, 14> sDeadly{{{SIGSEGV, {}},
                                {SIGBUS, {}},
                                {SIGFPE, {}},
                                {SIGILL, {}},
                                {SIGABRT, {}},
                                {SIGTRAP, {}},
                                {SIGSYS, {}},
                                {SIGXCPU, {}},
                                {SIGXFSZ, {}},
                                {SIGALRM, {}},
                                {SIGVTALRM, {}},
                                {SIGPROF, {}},
                                {SIGUSR1, {}},
                                {SIGUSR2, {}}}};

volatile std::sig_atomic_t sHasTerminal = 0;
termios sFound;
char sFarewell[256];
std::size_t sFarewellLength = 0;

alignas(std::max_align_t) std::array<std::byte, 65'536> sStack;

/// A capability as it goes to a terminal that needs no padding; nothing for one that is not there.
std::string unpadded(const char* capability) {
  std::string_view rest = capability != nullptr ? capability : "";
  std::string text;
  for (std::size_t padding; (padding = rest.find("$<")) != std::string_view::npos;) {
    text += rest.substr(0, padding);
    rest.remove_prefix(std::min(rest.find('>', padding), rest.size() - 1) + 1);
  }
  return text.append(rest);
}

/// What leaves the screen: attributes off, cursor there, keypad as it was, the other screen or a line of its
/// own below this one.
std::string farewell() {
  std::string text = unpadded(exit_attribute_mode) + unpadded(cursor_normal) + unpadded(keypad_local);
  text += exit_ca_mode != nullptr ? unpadded(exit_ca_mode) : unpadded(tiparm(cursor_address, LINES - 1, 0));
  return text + "\r\n";
}

void die(int signal) {
  if (sHasTerminal != 0) {
    sHasTerminal = 0;
    if (write(STDOUT_FILENO, sFarewell, sFarewellLength) >= 0) tcsetattr(STDIN_FILENO, TCSANOW, &sFound);
  }
  for (const Deadly& deadly : sDeadly) {
    if (deadly.signal == signal) sigaction(signal, &deadly.before, nullptr);
  }
  // Comes as soon as this returns.
  raise(signal);
}

}  // namespace

void rescueTerminal(const termios& found) {
  sFound = found;
  sFarewellLength = farewell().copy(sFarewell, sizeof sFarewell);
  sHasTerminal = 1;

  stack_t stack{};
  stack.ss_sp = sStack.data();
  stack.ss_size = sStack.size();
  sigaltstack(&stack, nullptr);
  struct sigaction action {};
  action.sa_handler = die;
  action.sa_flags = SA_ONSTACK;
  sigfillset(&action.sa_mask);
  for (Deadly& deadly : sDeadly) {
    sigaction(deadly.signal, nullptr, &deadly.before);
    if (deadly.before.sa_handler != SIG_IGN) sigaction(deadly.signal, &action, nullptr);
  }
}

void leaveTerminal() { sHasTerminal = 0; }

}  // namespace terminal
