#include "platform/stage/quantities.h"

#include <cstdio>

namespace stage {

std::string numberText(double number) {
  char text[32];
  std::snprintf(text, sizeof text, "%g", number);
  return text;
}

std::string timeText(Nanoseconds duration) {
  const Nanoseconds hours = duration / (3600 * kSecond);
  const Nanoseconds minutes = duration / (60 * kSecond) % 60;
  const double seconds = static_cast<double>(duration % (60 * kSecond)) / static_cast<double>(kSecond);
  std::string text;
  if (hours > 0) text += std::to_string(hours) + "h";
  if (minutes > 0) text += std::to_string(minutes) + "m";
  if (seconds > 0 || text.empty()) {
    char digits[32];
    std::snprintf(digits, sizeof digits, "%.10gs", seconds);
    text += digits;
  }
  return text;
}

std::string positionText(Nanoseconds position) {
  const Nanoseconds seconds = position / kSecond;
  const std::string rest = std::to_string(seconds % 60);
  return std::to_string(seconds / 60) + (rest.size() < 2 ? ":0" : ":") + rest;
}

}  // namespace stage
