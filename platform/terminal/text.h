// Text as a terminal counts it: in columns.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace terminal {

/// UTF-8 as wide characters, none of which moves the cursor: control characters become blanks, and what is
/// not UTF-8 becomes replacement characters.
std::wstring widen(std::string_view utf8);

/// How many columns the text takes.
int width(std::wstring_view text);

/// The text in at most so many columns; one that was cut ends in "…".
std::wstring clip(std::wstring_view text, int columns);

/// The text in lines of at most so many columns, broken at blanks where there are any; all lines but the
/// first begin with `indent` blanks. At least one line.
std::vector<std::wstring> wrap(std::wstring_view text, int columns, int indent);

}  // namespace terminal
