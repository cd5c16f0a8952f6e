// A report as people read it.
#pragma once

#include <string>

#include "report/object.h"

namespace report {

/// What describeDesktop has found, with the member "remotes" where there is one; lines of at most 100
/// columns.
std::string desktopText(const Object& desktop);

/// What describeButton has found.
std::string buttonText(const Object& button);

}  // namespace report
