// What kvremote's command line asks for.
#pragma once

#include <chrono>
#include <cstdint>
#include <span>
#include <string>
#include <vector>

#include "remote/words.h"

namespace remote {

enum class Action { ShowHelp, ShowVersion, ListButtons, SendButton, SetScreenLocked, Terminate };

struct Arguments {
  Action action = Action::ShowHelp;
  /// SendButton: which one, and the values to send, in order.
  std::uint16_t usagePage = 0;
  std::uint16_t usage = 0;
  std::uint16_t extra = 0;
  std::vector<std::int32_t> values;
  /// SendButton: how long to wait before each value but the first.
  std::chrono::milliseconds hold{0};
  /// SetScreenLocked: the new state.
  bool locked = false;
  /// Whose daemon gets the message; empty when nobody was named.
  std::string user;
};

/// Reads a command line, without the program's name. Throws UsageError.
Arguments parseArguments(std::span<const char* const> words);

}  // namespace remote
