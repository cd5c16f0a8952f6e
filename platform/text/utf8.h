// UTF-8: checking it, reading and writing single characters of it.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace text {

/// Takes the first character off the bytes. Nothing, and the bytes are left as they are, when they do not
/// begin with one: UTF-8 in its shortest form, without surrogates and within Unicode.
std::optional<char32_t> takeCharacter(std::string_view& bytes);

/// The offset of the first byte at which no character begins; npos when all of it is UTF-8.
std::size_t findInvalidUTF8(std::string_view bytes);
bool isUTF8(std::string_view bytes);

/// How many characters (code points) a text in UTF-8 has.
std::size_t characterCount(std::string_view utf8);

/// A text in UTF-8, without its end where it has more than so many bytes; no character is cut.
std::string_view truncated(std::string_view utf8, std::size_t mostBytes);

/// Appends one character, which must be a Unicode scalar value.
void appendUTF8(std::string& utf8, char32_t character);

}  // namespace text
