// One rehearsal: the whole daemon on a fresh desktop, in virtual time and in a process of its own.
#pragma once

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace simulator {

/// Gives the next command of the desktop whenever the daemon has nothing left to do; nothing ends the
/// rehearsal. It is called in the rehearsal's process, and may fork: each copy goes its own way from there.
using Commands = std::function<std::optional<std::string>()>;

/// A promise that was broken, in one line, and the commands that led there.
struct Failure {
  std::string what;
  std::vector<std::string> commands;
};

struct Rehearsal {
  Commands commands;
  /// A command that the desktop refuses ends the rehearsal; else it is ignored.
  bool endsAtRefusal = false;
  /// Called in the rehearsal's process before the daemon starts; may be empty.
  std::function<void()> prepare = nullptr;
};

/// Plays a rehearsal and watches the promises. Nothing when all were kept.
std::optional<Failure> rehearse(const Rehearsal& rehearsal);
/// The same with a list of commands, where refused ones are ignored.
std::optional<Failure> rehearse(const std::vector<std::string>& commands);

/// For commands that fork: true in a copy of this process; false here, once the copy has ended. Where a copy
/// has failed this process ends too.
bool inCopy();

/// Leaves the process that called rehearse a word; the last one counts.
void leaveWord(const std::string& word);
/// The word that the last rehearsal left, empty when it left none.
std::string wordLeft();

/// How many commands this process and its children have played.
std::uint64_t played();

/// A directory for the service socket of this process's rehearsals, so that they meet no kvd at work.
class RuntimeDirectory {
 public:
  RuntimeDirectory();
  RuntimeDirectory(const RuntimeDirectory&) = delete;
  RuntimeDirectory& operator=(const RuntimeDirectory&) = delete;
  ~RuntimeDirectory();

 private:
  std::string path_;
};

}  // namespace simulator
