// Small worlds, searched to the end.
#pragma once

namespace simulator {

/// Plays every sequence of up to `depth` stimuli in every small world. Prints what was played, and a failure
/// with its transcript. False when a promise was broken.
bool searchWorlds(int depth);

}  // namespace simulator
