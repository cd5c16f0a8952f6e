#include "platform/linux/programs/connections.h"

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <map>
#include <optional>
#include <string_view>
#include <utility>

#include "platform/base/run_loop.h"
#include "platform/linux/system/introspection.h"
#include "platform/linux/system/names.h"
#include "platform/linux/system/process.h"

namespace linux::programs {

namespace {

struct Newcomer {
  /// Null while nobody has told.
  const Program* program = nullptr;
  /// The turn in which it was last asked for its windows.
  std::optional<std::uint64_t> asked;
};

/// By unique name: those of whom it is not known yet whether they count.
std::map<std::string, Newcomer> sNewcomers;
std::vector<Connection> sConnections;
bool sChanged = false;
/// The connection that all this is known from, and whether it has told of all names that were there first.
unsigned sGeneration = 0;
bool sFirstAreKnown = false;

const Program* programNamed(std::string_view name) {
  const Program* const program = programByEntry(name);
  return program != nullptr && *program->windowsAt != '\0' ? program : nullptr;
}

bool concernsUs(std::string_view name) { return name.starts_with(':') || programNamed(name) != nullptr; }

bool counts(const std::string& uniqueName) {
  return std::ranges::any_of(sConnections, [&](const auto& each) { return each.callee.name == uniqueName; });
}

void takeOwnerChange(const std::string& name, const std::string&, const std::string& owner) {
  if (owner.empty()) {
    sNewcomers.erase(name);
    sChanged |= std::erase_if(sConnections, [&](const auto& each) { return each.callee.name == name; }) > 0;
  } else if (!counts(owner)) {
    Newcomer& newcomer = sNewcomers[owner];
    if (!name.starts_with(':')) newcomer.program = programNamed(name);
  }
}

constexpr system::NameFollower kFollower{concernsUs, takeOwnerChange};

void beginAnew() {
  sChanged = sChanged || !sConnections.empty();
  sNewcomers.clear();
  sConnections.clear();
  sGeneration = system::busGeneration();
  sFirstAreKnown = false;
  if (system::bus() != nullptr) system::followNames(kFollower);
}

/// Whether the bus has told the process of every newcomer.
bool areKnown() {
  // All are to be asked before anybody is waited for.
  return std::ranges::count_if(
             sNewcomers, [](const auto& each) { return !system::processOf(each.first).has_value(); }) == 0;
}

void awaitProcesses() {
  const system::Limit limit = system::patience(system::kQueryLimit);
  const base::Deadline deadline(limit);
  while (!areKnown()) {
    system::takeInBus();
    if (areKnown()) return;
    if (!system::waitForBus(deadline)) return system::noteWaitInVain(limit);
  }
}

/// Whether the program has a window. One that does not answer is taken to have one.
bool hasWindow(const Program& program, const system::Callee& callee) {
  return !system::childrenOf(callee, program.windowsAt).empty() || system::timedOutThisTurn(callee.process);
}

/// False for one that need not be looked at again.
bool staysNew(const std::string& uniqueName, Newcomer& newcomer) {
  const auto process = system::processOf(uniqueName);
  if (!process) return true;
  if (newcomer.program == nullptr) newcomer.program = programByExecutable(system::executableName(*process));
  if (newcomer.program == nullptr) return false;
  if (std::exchange(newcomer.asked, base::turn()) == base::turn()) return true;
  const system::Callee callee{uniqueName, *process};
  if (!hasWindow(*newcomer.program, callee)) return true;
  sConnections.push_back({newcomer.program, callee});
  sChanged = true;
  return false;
}

}  // namespace

bool takeInConnections() {
  if (system::bus() == nullptr || sGeneration != system::busGeneration()) beginAnew();
  if (!sFirstAreKnown) sFirstAreKnown = system::tellNames(kFollower);
  system::takeInBus();
  awaitProcesses();
  for (auto each = sNewcomers.begin(); each != sNewcomers.end();) {
    each = staysNew(each->first, each->second) ? std::next(each) : sNewcomers.erase(each);
  }
  return std::exchange(sChanged, false);
}

const std::vector<Connection>& connections() { return sConnections; }

windows::GtkNames gtkNamesOf(const Program& program, const std::string& uniqueName) {
  const std::string_view path = program.windowsAt;
  constexpr std::string_view kOfGtk = "/window";
  if (!path.ends_with(kOfGtk)) return {};
  return {uniqueName, std::string(path.substr(0, path.size() - kOfGtk.size())), std::string(path) + "/"};
}

}  // namespace linux::programs
