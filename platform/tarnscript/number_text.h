// Numbers as text.
#pragma once

#include <cstdint>
#include <string>

namespace tarnscript {

std::string toText(std::int64_t number);
/// The shortest text that reads back as this number, with a point so that it stays a real ("1.0").
std::string toText(double number);

}  // namespace tarnscript
