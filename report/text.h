// A report as people read it.
#pragma once

#include <cstddef>
#include <string>

#include "report/object.h"

namespace report {

/// From here on lines have at most so many columns, 100 otherwise; what is there to be copied stays whole.
void setColumns(std::size_t columns);

/// What describeDesktop has found, with the member "remotes" where there is one.
std::string desktopText(const Object& desktop);

/// What describeButton has found.
std::string buttonText(const Object& button);

}  // namespace report
