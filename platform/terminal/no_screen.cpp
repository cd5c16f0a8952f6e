// Where the library that draws is missing: no terminal can show a screen.

#include "platform/terminal/screen.h"

namespace terminal {

std::optional<int> play() { return std::nullopt; }

}  // namespace terminal
