#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace property_list {

/// The bytes behind a base64 text, blanks in it left out; nothing when it is malformed or its padding is
/// wrong.
std::optional<std::string> decodeBase64(std::string_view text);

}  // namespace property_list
