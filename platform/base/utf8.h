// UTF-8: checking it and writing one character of it.
#pragma once

#include <string>
#include <string_view>

namespace base {

/// True when the bytes are UTF-8 in its shortest form, without surrogates and within Unicode.
bool isUTF8(std::string_view bytes);

/// Appends one character, which must be a Unicode scalar value.
void appendUTF8(std::string& text, char32_t character);

}  // namespace base
