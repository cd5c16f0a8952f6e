#include <cstdio>
#include <exception>
#include <fstream>
#include <iterator>
#include <string>
#include <string_view>
#include <vector>

#include "remote/words.h"
#include "simulator/evenings.h"
#include "simulator/failing_host.h"
#include "simulator/worlds.h"

namespace {

constexpr char kHelp[] =
    "Usage: simulate worlds DEPTH\n"
    "       simulate evenings COUNT [SEED]\n"
    "       simulate evening SEED\n"
    "       simulate failing-host TRANSCRIPT...\n"
    "\n"
    "Plays the whole daemon on the rehearsal desktop, in virtual time, and watches what it promises.\n"
    "\n"
    "worlds        every sequence of up to DEPTH stimuli in each of a few small worlds\n"
    "evenings      COUNT random evenings; the first has this seed (1 where none is given)\n"
    "evening       prints the commands of one evening\n"
    "failing-host  the commands of each transcript, once for every call that the daemon makes of the host:\n"
    "              that call fails\n"
    "\n"
    "A broken promise is told with the transcript that leads to it. Exit status: 0 when all were kept, 1 "
    "when one\n"
    "was broken, 2 for a bad command line.\n";

using Arguments = std::vector<std::string>;

bool worlds(const Arguments& arguments) {
  const int depth = remote::parseNumber<std::uint8_t>("a depth", arguments.at(0));
  if (depth < 1) throw remote::UsageError("a depth is 1 or more");
  return simulator::searchWorlds(depth);
}

bool evenings(const Arguments& arguments) {
  const auto count = remote::parseNumber<std::uint32_t>("a number of evenings", arguments.at(0));
  const auto seed = arguments.size() > 1 ? remote::parseNumber<std::uint32_t>("a seed", arguments.at(1)) : 1;
  return simulator::playEvenings(count, seed);
}

bool printEvening(const Arguments& arguments) {
  for (const std::string& command :
       simulator::evening(remote::parseNumber<std::uint32_t>("a seed", arguments.at(0)))) {
    std::puts(command.c_str());
  }
  return true;
}

/// The commands of a transcript: its lines at the margin.
std::vector<std::string> commandsOf(const std::string& path) {
  std::ifstream file(path);
  if (!file) throw remote::UsageError("cannot read " + path);
  std::vector<std::string> commands;
  for (std::string line; std::getline(file, line);) {
    if (!line.empty() && line.front() != ' ' && line.front() != '#') commands.push_back(line);
  }
  return commands;
}

bool failingHost(const Arguments& arguments) {
  bool kept = true;
  for (const std::string& path : arguments) kept = simulator::failEachCall(path, commandsOf(path)) && kept;
  return kept;
}

struct Work {
  std::string_view name;
  std::size_t fewest;
  std::size_t most;
  bool (*run)(const Arguments& arguments);
};

constexpr Work kWorks[] = {
    {"worlds", 1, 1, worlds},
    {"evenings", 1, 2, evenings},
    {"evening", 1, 1, printEvening},
    {"failing-host", 1, 1000, failingHost},
};

}  // namespace

int main(int argc, char** argv) {
  Arguments arguments(argv + 1, argv + argc);
  if (argc == 2 && arguments.front() == "--help") {
    std::fputs(kHelp, stdout);
    return 0;
  }
  try {
    for (const Work& work : kWorks) {
      if (argc < 2 || arguments.front() != work.name) continue;
      arguments.erase(arguments.begin());
      if (arguments.size() < work.fewest || arguments.size() > work.most) break;
      return work.run(arguments) ? 0 : 1;
    }
    std::fputs(
        "Usage: simulate worlds DEPTH | evenings COUNT [SEED] | evening SEED | failing-host TRANSCRIPT... | "
        "--help\n",
        stderr);
    return 2;
  } catch (const remote::UsageError& error) {
    std::fprintf(stderr, "simulate: %s\n", error.what());
    return 2;
  } catch (const std::exception& error) {
    std::fprintf(stderr, "simulate: %s\n", error.what());
    return 1;
  }
}
