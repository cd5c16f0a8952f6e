// What a report says, whether it is shown to people or to programs.
#pragma once

#include <nlohmann/json.hpp>

namespace report {

/// An object of JSON with its members in the order in which they are shown; kvd-report(1) names them.
using Object = nlohmann::ordered_json;

}  // namespace report
