// Work side by side, and how failures are told.
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "simulator/rehearsal.h"

namespace simulator {

/// How many workers this machine feeds.
std::size_t workerCount();

/// Runs the parts of a job, each in a process with a service socket of its own. The number of commands that
/// were played; nothing when a part has failed: then the failure and its transcript have been printed.
std::optional<std::uint64_t> inParallel(std::size_t parts,
                                        const std::function<std::optional<Failure>(std::size_t part)>& run);

/// The shortest list of commands, found by leaving some out, that still fails.
Failure shortest(Failure failure);

}  // namespace simulator
