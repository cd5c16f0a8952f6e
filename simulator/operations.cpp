#include "simulator/operations.h"

#include "simulator/rehearsal.h"

namespace simulator {

namespace {

std::uint64_t sCalls = 0;
std::uint64_t sFailing = 0;

}  // namespace

void letCallFail(std::uint64_t number) {
  sCalls = 0;
  sFailing = number;
}

std::uint64_t callCount() { return sCalls; }

bool fails(const char* operation) {
  if (++sCalls != sFailing) return false;
  leaveWord(operation);
  return true;
}

}  // namespace simulator
