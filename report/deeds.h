// What the core would have done: held back, and written down in its order.
#pragma once

#include <sys/types.h>

#include <string>
#include <vector>

#include "platform/linux/programs/running.h"
#include "platform/tarnscript/tarnscript.h"

namespace report {

struct Deed {
  /// None for what the desktop itself does, such as its volume.
  linux::programs::Role role = linux::programs::Role::None;
  /// Who is told, by name.
  std::string program;
  pid_t process = 0;
  /// What, in the words of scripts.
  std::string words;
  /// How, by the table of programs, the ways in the order in which they are tried; empty where the role
  /// itself knows.
  std::vector<std::string> ways;
};

void note(Deed deed);

/// That a program is told something: a word that may have rows in the table of programs, or 0.
void noteFor(const linux::programs::Instance& instance, std::string words, tarnscript::Code word);

/// That a key is posted to a program.
void noteKey(const linux::programs::Instance& instance, std::uint16_t virtualKey, bool withShift);

/// That the role's program is started.
void noteStart(linux::programs::Role role);

/// What was written down since the last call.
std::vector<Deed> takeDeeds();

}  // namespace report
