#include "simulator/worlds.h"

#include <cstdio>
#include <string>
#include <vector>

#include "simulator/failures.h"
#include "simulator/rehearsal.h"

namespace simulator {

namespace {

/// Three applications, and where they stand when the search begins.
struct World {
  const char* name;
  const char* applications[3];
  /// Longer than kvd stays without a button; less where a held button repeats a hundred times a second.
  const char* night;
  std::vector<std::string> beginning;
};

const World kWorlds[] = {
    {"an empty desktop", {"lyrabox", "spindle", "slidewell"}, "2h20m", {}},
    {"a film, a disc and music",
     {"lyrabox", "spindle", "vistremeplayerx"},
     "2h20m",
     {"open lyrabox", "open spindle", "open vistremeplayerx", "tell lyrabox to play",
      "tell spindle to play dvd"}},
    {"a disc's menu beside a film",
     {"spindle", "com.tarn.vistremeplayer", "lyrabox"},
     "1m",
     {"open spindle", "tell spindle to go to main menu", "open com.tarn.vistremeplayer",
      "front com.tarn.vistremeplayer", "volume 100"}},
    {"shows",
     {"slidewell", "snapvale", "lumbra"},
     "2h20m",
     {"open slidewell", "open snapvale", "open lumbra", "front slidewell",
      "tell slidewell to start slideshow"}},
    {"photos with music",
     {"lumbra", "snapvale", "lyrabox"},
     "2h20m",
     {"version snapvale 7.1", "open lumbra", "open snapvale", "open lyrabox", "tell lyrabox to play",
      "front lumbra"}},
};

/// What can happen in any of them.
const std::string kStimuli[] = {
    "press select", "press playpause", "press pick",      "press stop", "press menu", "press up",
    "release up",   "press forward",   "release forward", "lock on",    "lock off",   "quit",
    "front nobody", "wait 2s",         "wait 10s",
};
/// And what can happen to each application.
const std::string kFates[] = {"open %", "close %", "front %", "answers % errors", "hang % 3s"};

std::vector<std::string> stimuliOf(const World& world) {
  std::vector<std::string> all(std::begin(kStimuli), std::end(kStimuli));
  all.push_back(std::string("wait ") + world.night);
  for (const char* const application : world.applications) {
    for (std::string fate : kFates) all.push_back(fate.replace(fate.find('%'), 1, application));
  }
  return all;
}

/// The search, cut in so many parts by the first stimulus.
struct Search {
  const World& world;
  std::size_t depth;
  std::size_t part;
  std::size_t parts;
};

std::optional<Failure> search(const Search& asked) {
  const std::vector<std::string> stimuli = stimuliOf(asked.world);
  std::size_t step = 0;
  const std::size_t begin = asked.world.beginning.size();
  const auto next = [&]() -> std::optional<std::string> {
    if (step < begin) return asked.world.beginning[step++];
    if (step == begin + asked.depth) return std::nullopt;
    for (std::size_t i = 0; i < stimuli.size(); ++i) {
      if (step == begin && i % asked.parts != asked.part) continue;
      if (!inCopy()) continue;
      ++step;
      return stimuli[i];
    }
    return std::nullopt;
  };
  return rehearse({.commands = next, .endsAtRefusal = true});
}

}  // namespace

bool searchWorlds(int depth) {
  for (const World& world : kWorlds) {
    // The shortest failure first.
    for (std::size_t reached = 1; reached <= static_cast<std::size_t>(depth); ++reached) {
      const std::size_t parts = reached < 3 ? 1 : workerCount();
      const auto played = inParallel(parts, [&](std::size_t part) {
        return search({world, reached, part, parts});
      });
      if (!played) return false;
      if (reached == static_cast<std::size_t>(depth))
        std::printf("%s: all sequences of %d, %llu commands\n", world.name, depth,
                    static_cast<unsigned long long>(*played));
    }
  }
  return true;
}

}  // namespace simulator
