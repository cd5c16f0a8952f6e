// What there is to tell at the end, and when asked.
#pragma once

#include <string>

namespace stage {

/// The objects that are alive, by kind: "list ×1, serial number ×2"; "nothing" where there are none.
std::string aliveText();

}  // namespace stage
