// In the order of the header: conversions, then comparison, then arithmetic, then the operators that use
// them.
#include "platform/tarnscript/values.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <utility>

#include "platform/tarnscript/number_text.h"
#include "platform/text/case.h"

namespace tarnscript {

namespace {

/// The lowest integer and the first beyond the highest, which reals can hold exactly.
constexpr double kIntegerFloor = -9223372036854775808.0;
constexpr double kIntegerCeiling = 9223372036854775808.0;

std::optional<std::int64_t> truncated(double number) {
  if (!(number >= kIntegerFloor && number < kIntegerCeiling)) return std::nullopt;
  return static_cast<std::int64_t>(number);
}

std::optional<double> asReal(const Value& value) {
  if (const auto* integer = std::get_if<std::int64_t>(&value)) return static_cast<double>(*integer);
  if (const auto* real = std::get_if<double>(&value)) return *real;
  return std::nullopt;
}

std::optional<std::string> asText(const Value& value) {
  if (const auto* text = std::get_if<std::string>(&value)) return *text;
  if (const auto* integer = std::get_if<std::int64_t>(&value)) return toText(*integer);
  if (const auto* real = std::get_if<double>(&value)) return toText(*real);
  return std::nullopt;
}

/// A constant or a list of them ("using {command down, shift down}").
bool isConstant(const Value& value) {
  const auto* list = std::get_if<List>(&value);
  const auto single = [](const Value& one) { return std::holds_alternative<Constant>(one); };
  return list == nullptr ? single(value) : std::ranges::all_of(elementsOf(*list), single);
}

/// Lists within this one, itself included. Charged, because lists that share their elements can be far
/// larger to walk than to store.
int listDepth(const Value& value, Budget& budget) {
  const auto* list = std::get_if<List>(&value);
  if (list == nullptr) return 0;
  int deepest = 0;
  for (const Value& element : elementsOf(*list)) {
    budget.charge(1);
    deepest = std::max(deepest, listDepth(element, budget));
  }
  return deepest + 1;
}

}  // namespace

std::int32_t toInt32(const Value& value) {
  constexpr auto kLow = std::numeric_limits<std::int32_t>::min();
  constexpr auto kHigh = std::numeric_limits<std::int32_t>::max();
  if (const auto* boolean = std::get_if<bool>(&value)) return *boolean ? 1 : 0;
  if (const auto* integer = std::get_if<std::int64_t>(&value)) {
    return static_cast<std::int32_t>(std::clamp<std::int64_t>(*integer, kLow, kHigh));
  }
  if (const auto* real = std::get_if<double>(&value)) {
    return std::isnan(*real) ? 0 : static_cast<std::int32_t>(std::clamp<double>(*real, kLow, kHigh));
  }
  return 0;
}

Code toTypeCode(const Value& value) {
  const auto* constant = std::get_if<Constant>(&value);
  return constant == nullptr ? 0 : constant->code;
}

std::string_view kindName(const Value& value) {
  constexpr std::array<std::string_view, 9> kNames = {"nothing",   "a boolean", "an integer",
                                                      "a real",    "a text",    "a constant",
                                                      "an object", "a list",    "a record"};
  static_assert(kNames.size() == std::variant_size_v<Value::variant>);
  return kNames[value.index()];
}

std::span<const Value> elementsOf(const List& list) {
  return list == nullptr ? std::span<const Value>() : std::span<const Value>(*list);
}

Value makeList(std::vector<Value> elements, Budget& budget) {
  if (elements.size() > kMaxListLength) throw Failure{"a list is too long"};
  for (const Value& element : elements) {
    if (listDepth(element, budget) >= kMaxListDepth) throw Failure{"lists are nested too deeply"};
  }
  return std::make_shared<const std::vector<Value>>(std::move(elements));
}

std::optional<std::int64_t> wholeNumber(const Value& value) {
  if (const auto* integer = std::get_if<std::int64_t>(&value)) return *integer;
  const auto* real = std::get_if<double>(&value);
  return real != nullptr && std::trunc(*real) == *real ? truncated(*real) : std::nullopt;
}

bool truth(const Value& value) {
  const auto* boolean = std::get_if<bool>(&value);
  if (boolean == nullptr) throw Failure{"expected true or false, not " + std::string(kindName(value))};
  return *boolean;
}

Value coerce(Value value, Type type) {
  const auto refuse = [&value](const char* wanted) -> Value {
    throw Failure{"cannot make " + std::string(kindName(value)) + " into " + wanted};
  };
  switch (type) {
    case Type::Boolean:
      return std::holds_alternative<bool>(value) ? value : refuse("a boolean");
    case Type::Constant:
      return isConstant(value) ? value : refuse("a constant");
    case Type::Object:
      return std::holds_alternative<ObjectRef>(value) ? value : refuse("an object");
    case Type::Real:
      if (const auto real = asReal(value)) return *real;
      return refuse("a real");
    case Type::Integer: {
      if (std::holds_alternative<std::int64_t>(value)) return value;
      const auto* real = std::get_if<double>(&value);
      const auto integer = real == nullptr ? std::nullopt : truncated(*real);
      return integer ? Value(*integer) : refuse("an integer");
    }
    case Type::Text:
      if (auto text = asText(value)) return std::move(*text);
      return refuse("a text");
  }
  return refuse("a value");
}

bool equal(const Value& a, const Value& b, Budget& budget) {
  budget.chargeCopy(a);
  if (a.index() != b.index()) {
    const auto x = asReal(a);
    const auto y = asReal(b);
    return x && y && *x == *y;
  }
  if (const auto* text = std::get_if<std::string>(&a))
    return text::equalIgnoringCase(*text, std::get<std::string>(b));
  if (const auto* list = std::get_if<List>(&a)) {
    const auto x = elementsOf(*list);
    const auto y = elementsOf(std::get<List>(b));
    return std::equal(x.begin(), x.end(), y.begin(), y.end(),
                      [&budget](const Value& p, const Value& q) { return equal(p, q, budget); });
  }
  if (const auto* record = std::get_if<Record>(&a)) {
    const auto& other = std::get<Record>(b);
    if (*record == nullptr || other == nullptr) return *record == other;
    return std::equal((*record)->begin(), (*record)->end(), other->begin(), other->end(),
                      [&budget](const auto& p, const auto& q) {
                        return p.first == q.first && equal(p.second, q.second, budget);
                      });
  }
  return static_cast<const Value::variant&>(a) == static_cast<const Value::variant&>(b);
}

namespace {

[[noreturn]] void refuseOperands(const Value& a, const Value& b) {
  throw Failure{"cannot calculate with " + std::string(kindName(a)) + " and " + std::string(kindName(b))};
}

/// Negative, zero or positive; only numbers and texts have an order.
int order(const Value& a, const Value& b) {
  const auto* text = std::get_if<std::string>(&a);
  const auto* other = std::get_if<std::string>(&b);
  if (text != nullptr && other != nullptr) return text::compareIgnoringCase(*text, *other);
  const auto x = asReal(a);
  const auto y = asReal(b);
  if (!x || !y) {
    throw Failure{"cannot order " + std::string(kindName(a)) + " and " + std::string(kindName(b))};
  }
  return *x < *y ? -1 : *x > *y ? 1 : 0;
}

/// The integer result; none where it does not fit and the reals must do.
std::optional<std::int64_t> calculate(Operator op, std::int64_t a, std::int64_t b) {
  std::int64_t result = 0;
  switch (op) {
    case Operator::Add:
      return __builtin_add_overflow(a, b, &result) ? std::nullopt : std::optional(result);
    case Operator::Subtract:
      return __builtin_sub_overflow(a, b, &result) ? std::nullopt : std::optional(result);
    case Operator::Multiply:
      return __builtin_mul_overflow(a, b, &result) ? std::nullopt : std::optional(result);
    // The lowest integer has no positive counterpart; the processor traps on both of these with it.
    case Operator::IntegerDivide:
      return b == -1 ? calculate(Operator::Subtract, 0, a) : std::optional(a / b);
    case Operator::Modulo:
      return b == -1 ? 0 : a % b;
    default:
      return std::nullopt;
  }
}

Value calculate(Operator op, double a, double b) {
  double result = 0;
  switch (op) {
    case Operator::Add:
      result = a + b;
      break;
    case Operator::Subtract:
      result = a - b;
      break;
    case Operator::Multiply:
      result = a * b;
      break;
    case Operator::IntegerDivide:
      result = std::trunc(a / b);
      if (const auto integer = truncated(result)) return *integer;
      break;
    case Operator::Modulo:
      result = std::fmod(a, b);
      break;
    default:
      result = a / b;
      break;
  }
  if (!std::isfinite(result)) throw Failure{"the result is too large"};
  return result;
}

Value calculate(Operator op, const Value& a, const Value& b) {
  const auto x = asReal(a);
  const auto y = asReal(b);
  if (!x || !y) refuseOperands(a, b);
  const bool divides = op == Operator::Divide || op == Operator::IntegerDivide || op == Operator::Modulo;
  if (divides && *y == 0) throw Failure{"division by zero"};
  const auto* integerA = std::get_if<std::int64_t>(&a);
  const auto* integerB = std::get_if<std::int64_t>(&b);
  if (integerA != nullptr && integerB != nullptr) {
    if (const auto result = calculate(op, *integerA, *integerB)) return *result;
  }
  return calculate(op, *x, *y);
}

void append(std::vector<Value>& elements, const Value& value, Budget& budget) {
  const auto* list = std::get_if<List>(&value);
  for (const Value& element : list == nullptr ? std::span(&value, 1) : elementsOf(*list)) {
    budget.chargeCopy(element);
    elements.push_back(element);
  }
}

Value concatenate(const Value& a, const Value& b, Budget& budget) {
  if (std::holds_alternative<List>(a) || std::holds_alternative<List>(b)) {
    std::vector<Value> elements;
    append(elements, a, budget);
    append(elements, b, budget);
    return makeList(std::move(elements), budget);
  }
  auto left = asText(a);
  const auto right = asText(b);
  if (!left || !right) refuseOperands(a, b);
  if (left->size() + right->size() > kMaxTextLength) throw Failure{"a text is too long"};
  Value result = std::move(*left += *right);
  budget.chargeCopy(result);
  return result;
}

}  // namespace

Value apply(Operator op, const Value& a, const Value& b, Budget& budget) {
  switch (op) {
    case Operator::Equal:
      return equal(a, b, budget);
    case Operator::NotEqual:
      return !equal(a, b, budget);
    case Operator::Less:
      return order(a, b) < 0;
    case Operator::LessOrEqual:
      return order(a, b) <= 0;
    case Operator::Greater:
      return order(a, b) > 0;
    case Operator::GreaterOrEqual:
      return order(a, b) >= 0;
    case Operator::Concatenate:
      return concatenate(a, b, budget);
    default:
      return calculate(op, a, b);
  }
}

Value negate(const Value& value) {
  if (const auto* real = std::get_if<double>(&value)) return -*real;
  if (!std::holds_alternative<std::int64_t>(value)) refuseOperands(Value(std::int64_t{0}), value);
  return calculate(Operator::Subtract, Value(std::int64_t{0}), value);
}

}  // namespace tarnscript
