// What can be done with values: coercion, comparison, arithmetic, concatenation. Everything that can go wrong
// throws Failure; everything that costs is charged to a Budget.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "platform/tarnscript/limits.h"
#include "platform/tarnscript/tarnscript.h"

namespace tarnscript {

/// Why a statement cannot go on. What an application caused is forgiven where its responses are ignored.
struct Failure {
  std::string message;
  bool byApplication = false;
};

/// The work that one run may still do.
class Budget {
 public:
  /// Throws Failure when the work of the run is used up.
  void charge(std::size_t steps) {
    if (steps > left_) throw Failure{"the script does too much"};
    left_ -= steps;
  }
  /// Charges for a copy of a value.
  void chargeCopy(const Value& value) {
    const auto* text = std::get_if<std::string>(&value);
    charge(text == nullptr ? 1 : 1 + text->size() / kBytesPerStep);
  }

 private:
  std::size_t left_ = kMaxSteps;
};

enum class Operator {
  Or,
  And,
  Equal,
  NotEqual,
  Less,
  LessOrEqual,
  Greater,
  GreaterOrEqual,
  Concatenate,
  Add,
  Subtract,
  Multiply,
  Divide,
  IntegerDivide,
  Modulo,
};

/// "an integer", "a list": for messages.
std::string_view kindName(const Value& value);

/// The elements of a list; none of a null one.
std::span<const Value> elementsOf(const List& list);
/// A new list; refused when it is too long or too deep.
Value makeList(std::vector<Value> elements, Budget& budget);

/// The number as an integer, when it is a whole one in range.
std::optional<std::int64_t> wholeNumber(const Value& value);
bool truth(const Value& value);

/// The value as a property or parameter of this type holds it: integers become reals, reals lose their
/// fraction, numbers become texts; nothing else changes its kind. A list of constants passes as a constant.
/// Throws Failure for everything else, and for no value at all.
Value coerce(Value value, Type type);

/// Whether two values are equal. Numbers compare by value and texts without regard to case; values of
/// different kinds are not equal, which is no failure.
bool equal(const Value& a, const Value& b, Budget& budget);

/// An operator other than "and" and "or", which the evaluator settles itself. Integer results that do not fit
/// become reals; "/" always gives a real, "div" and "mod" round toward zero.
Value apply(Operator op, const Value& a, const Value& b, Budget& budget);
Value negate(const Value& value);

}  // namespace tarnscript
