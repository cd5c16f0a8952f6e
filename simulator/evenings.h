// Evenings at random: an hour of a household's worst.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace simulator {

/// The commands of one evening; the same for the same seed, on every machine.
std::vector<std::string> evening(std::uint64_t seed);

/// Plays so many evenings, the first with this seed and each further one with the next. A failure prints its
/// seed and the transcript of the shortest list of its commands that still fails. False when a promise was
/// broken.
bool playEvenings(std::uint64_t count, std::uint64_t firstSeed);

}  // namespace simulator
