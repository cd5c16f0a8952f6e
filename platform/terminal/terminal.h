// The terminal while it is a screen: from opening it to leaving it as it was found.
#pragma once

#include <termios.h>

#include <memory>
#include <optional>

#include "platform/terminal/keypress.h"

namespace terminal {

class Terminal {
 public:
  /// Turns the terminal on standard input and output into a screen; null when it cannot be one. Also takes
  /// over the signals that concern a terminal, which from then on arrive at `signals`.
  static std::unique_ptr<Terminal> open();
  ~Terminal();
  Terminal(const Terminal&) = delete;
  Terminal& operator=(const Terminal&) = delete;

  /// Readable when a signal has come.
  int signals() const { return signals_; }
  /// Does what the signals ask for: takes the new size, stops and comes back. False when the program is to
  /// end.
  bool obeySignals();

  /// The next key that was pressed, if there is one.
  std::optional<Keypress> read();
  /// Whether the terminal is gone.
  bool hungUp() const;

 private:
  Terminal() = default;

  void takeSize();
  void stop();
  void comeBack();

  int signals_ = -1;
  /// Of the terminal while it is the screen.
  termios modes_{};
};

}  // namespace terminal
