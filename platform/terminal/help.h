// The text behind the ? key.
#pragma once

#include <span>
#include <string_view>

namespace terminal {

/// A key and what it does; a row without a key is prose.
struct HelpRow {
  std::wstring_view key;
  std::wstring_view text;
};

/// What the keys take of a row.
inline constexpr int kHelpKeyColumns = 13;
std::span<const HelpRow> helpRows();

}  // namespace terminal
