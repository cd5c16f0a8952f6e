// The applications as a person chooses among them.
#pragma once

#include <string_view>
#include <vector>

#include "daemon/kvd.h"
#include "platform/stage/desktop.h"

namespace terminal {

/// Those that can be opened, in the order of the digits that stand for them. What is always there without
/// having been opened, a helper, is not among them.
std::vector<const stage::Application*> openable(const stage::Desktop& desktop);

/// What it is, for somebody who meets its name for the first time: "disc player". Empty when nobody knows.
std::string_view roleOf(const stage::Application& application);

/// The application of a code, null for the codes that stand for none.
const stage::Application* applicationOf(AppCode code);

}  // namespace terminal
