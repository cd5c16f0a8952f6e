#include "platform/terminal/terminal.h"

#include <curses.h>
#include <locale.h>
#include <poll.h>
#include <sys/ioctl.h>
#include <sys/signalfd.h>
#include <term.h>
#include <termios.h>
#include <unistd.h>

#include <csignal>
#include <cstdio>
#include <cstring>
#include <cwctype>

#include "platform/base/signal_set.h"
#include "platform/terminal/rescue.h"

namespace terminal {

namespace {

/// How long, in milliseconds, the bytes of one key may take to follow an Escape: over a slow line they are
/// apart.
constexpr int kEscapeDelay = 100;

/// Box drawing and arrows take UTF-8. A system that never chose a locale gets the one without a country; who
/// chose another encoding keeps it.
void chooseLocale() {
  const char* const chosen = setlocale(LC_CTYPE, "");
  if (chosen == nullptr || std::strcmp(chosen, "C") == 0 || std::strcmp(chosen, "POSIX") == 0) {
    setlocale(LC_CTYPE, "C.UTF-8");
  }
}

sigset_t terminalSignals() {
  sigset_t signals = base::signalSet({SIGWINCH, SIGCONT, SIGHUP, SIGQUIT});
  struct sigaction stop {};
  sigaction(SIGTSTP, nullptr, &stop);
  // Without job control the shell has it ignored, and nobody would continue what stopped.
  if (stop.sa_handler != SIG_IGN) sigaddset(&signals, SIGTSTP);
  return signals;
}

Special specialOf(wint_t code) {
  switch (code) {
    case KEY_UP:
      return Special::Up;
    case KEY_DOWN:
      return Special::Down;
    case KEY_LEFT:
      return Special::Left;
    case KEY_RIGHT:
      return Special::Right;
    case KEY_ENTER:
      return Special::Enter;
    case KEY_BACKSPACE:
      return Special::Backspace;
    case KEY_PPAGE:
      return Special::PageUp;
    case KEY_NPAGE:
      return Special::PageDown;
    default:
      return Special::Other;
  }
}

Keypress keypressOf(wint_t character) {
  switch (character) {
    case L'\r':
    case L'\n':
      return {0, Special::Enter};
    case L'\x1B':
      return {0, Special::Escape};
    case L'\b':
    case L'\x7F':
      return {0, Special::Backspace};
    default:
      if (std::iswprint(character) == 0) return {0, Special::Other};
      return {static_cast<wchar_t>(character), Special::None};
  }
}

bool sameModes(const termios& one, const termios& other) {
  return one.c_lflag == other.c_lflag && one.c_iflag == other.c_iflag && one.c_oflag == other.c_oflag;
}

/// Gives the terminal its own modes and screen back. One that has no other screen gets an empty last line, on
/// which the shell goes on.
void leaveScreen() {
  move(LINES - 1, 0);
  clrtoeol();
  refresh();
  endwin();
}

}  // namespace

std::unique_ptr<Terminal> Terminal::open() {
  chooseLocale();
  set_escdelay(kEscapeDelay);
  termios found{};
  tcgetattr(STDIN_FILENO, &found);
  SCREEN* const opened = newterm(nullptr, stdout, stdin);
  if (opened == nullptr) return nullptr;
  const bool movesCursor = cursor_address != nullptr;
  const sigset_t wanted = terminalSignals();
  const int signals = movesCursor ? signalfd(-1, &wanted, SFD_CLOEXEC | SFD_NONBLOCK) : -1;
  if (signals < 0) {
    endwin();
    delscreen(opened);
    return nullptr;
  }
  sigprocmask(SIG_BLOCK, &wanted, nullptr);
  std::unique_ptr<Terminal> terminal(new Terminal);
  terminal->signals_ = signals;
  // Ctrl-C and Ctrl-Z stay signals.
  cbreak();
  noecho();
  nodelay(stdscr, TRUE);
  keypad(stdscr, TRUE);
  tcgetattr(STDIN_FILENO, &terminal->modes_);
  rescueTerminal(found);
  return terminal;
}

Terminal::~Terminal() {
  leaveScreen();
  leaveTerminal();
  close(signals_);
}

std::optional<Keypress> Terminal::read() {
  wint_t code = 0;
  int kind = get_wch(&code);
  // No key: the echo of a new size that was taken already.
  while (kind == KEY_CODE_YES && code == KEY_RESIZE) kind = get_wch(&code);
  switch (kind) {
    case KEY_CODE_YES:
      return Keypress{0, specialOf(code)};
    case OK:
      return keypressOf(code);
    default:
      return std::nullopt;
  }
}

bool Terminal::hungUp() const {
  pollfd input{STDIN_FILENO, POLLIN, 0};
  return poll(&input, 1, 0) > 0 && (input.revents & (POLLHUP | POLLERR | POLLNVAL)) != 0;
}

bool Terminal::obeySignals() {
  signalfd_siginfo info{};
  while (::read(signals_, &info, sizeof info) == sizeof info) {
    switch (info.ssi_signo) {
      case SIGWINCH:
        takeSize();
        break;
      case SIGTSTP:
        stop();
        break;
      case SIGCONT:
        comeBack();
        break;
      default:
        return false;
    }
  }
  return true;
}

void Terminal::takeSize() {
  winsize size{};
  if (ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) != 0 || size.ws_row == 0 || size.ws_col == 0) return;
  resizeterm(size.ws_row, size.ws_col);
}

/// Leaves the screen and stops as any program does; returns when somebody continues it.
void Terminal::stop() {
  termios current{};
  tcgetattr(STDIN_FILENO, &current);
  const sigset_t writing = base::signalSet({SIGTTOU});
  sigprocmask(SIG_BLOCK, &writing, nullptr);
  leaveScreen();
  // Where a parent stopped first the shell may have the terminal already, in the modes of its own line.
  if (!sameModes(current, modes_)) tcsetattr(STDIN_FILENO, TCSANOW, &current);
  sigprocmask(SIG_UNBLOCK, &writing, nullptr);

  std::signal(SIGTSTP, SIG_DFL);
  raise(SIGTSTP);
  const sigset_t stopping = base::signalSet({SIGTSTP});
  sigprocmask(SIG_UNBLOCK, &stopping, nullptr);
  sigprocmask(SIG_BLOCK, &stopping, nullptr);
  comeBack();
}

void Terminal::comeBack() {
  // The shell had the terminal meanwhile: its modes, its size and what it shows may all be others.
  reset_prog_mode();
  takeSize();
  clearok(curscr, TRUE);
}

}  // namespace terminal
