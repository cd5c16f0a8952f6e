// A session of a test's own: a directory, a bus, programs that do as they are told (fake_player.cpp), and a
// journal of what kvd sends to them and to the windows (fake_windows.h).
#pragma once

#include <sys/types.h>

#include <cstdio>
#include <string>
#include <string_view>
#include <vector>

namespace fake {

/// Starts the bus, and sets the environment of this process and its children. Once in a process.
void beginSession();
/// Ends everything that was started, and removes the directory.
void endSession();

/// Writes a desktop entry, each of the lines a "Key=value".
void writeEntry(const std::string& id, const std::vector<std::string>& lines);

/// A program that runs.
struct Program {
  std::string name;
  pid_t process = 0;
  /// On the bus.
  std::string uniqueName;
  /// Its standard input and output, in lines.
  std::FILE* lines = nullptr;
  bool stopped = false;
};

// All throw remote::UsageError for a program that does not run, and for words that it does not know.

/// Starts a program with this executable name, later than those before it by the kernel's clock.
void startProgram(const std::string& name, const std::string& executable, std::vector<std::string> words);
const Program& program(std::string_view name);
void tellProgram(const std::string& name, const std::string& words);
/// Its windows go too.
void endProgram(const std::string& name);
/// Stops it where it stands, or lets it go on.
void freeze(const std::string& name, bool stopped);

/// Runs a script as a button does. "= 1" or "= 'kPSP'" for its result, "fails" for an error.
std::string runScript(const std::string& source);

/// Waits until all that was sent has arrived, here and at every program that is not stopped. What has reached
/// programs and windows since the last call, in the order in which it was sent: "mpv: Set Rate 2".
std::vector<std::string> takeJournal();

}  // namespace fake
