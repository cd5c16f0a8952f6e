// What there is to tell at the end, and when asked.
#pragma once

#include <string>

namespace stage {

/// The objects that are alive, by kind: "2 serial numbers, 1 list"; "nothing" where there are none.
std::string aliveText();

}  // namespace stage
