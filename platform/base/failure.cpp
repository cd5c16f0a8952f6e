#include "platform/base/failure.h"

#include <utility>

namespace base {
namespace {

std::string& kept() {
  static auto& line = *new std::string;
  return line;
}

}  // namespace

void noteFailure(std::string line) { kept() = std::move(line); }

const std::string& lastFailure() { return kept(); }

}  // namespace base
