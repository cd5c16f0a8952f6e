#include "platform/tarnscript/number_text.h"

#include <array>
#include <charconv>

namespace tarnscript {

std::string toText(std::int64_t number) { return std::to_string(number); }

std::string toText(double number) {
  std::array<char, 32> buffer{};
  const auto [end, status] = std::to_chars(buffer.data(), buffer.data() + buffer.size(), number);
  std::string text(buffer.data(), end);
  if (text.find_first_of(".e") == std::string::npos) text += ".0";
  return text;
}

}  // namespace tarnscript
