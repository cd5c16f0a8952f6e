// What to try next: a few lessons, each over when the person has seen what it shows.
#pragma once

#include <cstddef>
#include <set>
#include <string>

#include "platform/stage/desktop.h"

namespace terminal {

class Lessons {
 public:
  /// Takes note of what the person got to see.
  void observe(const stage::Desktop& desktop);
  /// What to try next, in one line.
  std::string hint(const stage::Desktop& desktop) const;

 private:
  bool learnt(const stage::Desktop& desktop) const;

  std::size_t lesson_ = 0;
  /// The applications that something has played in.
  std::set<const stage::Application*> played_;
  int loudness_ = -1;  ///< the output volume at the beginning
};

}  // namespace terminal
