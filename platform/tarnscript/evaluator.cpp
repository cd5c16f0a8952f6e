#include "platform/tarnscript/evaluator.h"

#include <utility>

#include "platform/text/utf8.h"

namespace tarnscript {

namespace {

/// Does something when the scope is left, by a Failure too.
template <typename Action>
class AtEnd {
 public:
  explicit AtEnd(Action action) : action_(std::move(action)) {}
  ~AtEnd() { action_(); }
  AtEnd(const AtEnd&) = delete;
  AtEnd& operator=(const AtEnd&) = delete;

 private:
  Action action_;
};

}  // namespace

Evaluator::Evaluator(const Program& program, World& world)
    : program_(program), additions_(world.additions()), variables_(program.variables.size()) {}

Outcome Evaluator::run() {
  try {
    runBody(program_.body);
    return {std::move(result_), std::nullopt};
  } catch (const Failure& failure) {
    return {Value{}, Error{failure.message, line_}};
  }
}

// ---- Statements

Evaluator::Flow Evaluator::runBody(StatementRef first) {
  for (StatementRef at = first; at != kNone; at = program_.statements[at].next) {
    const Flow flow = runStatement(program_.statements[at]);
    if (flow != Flow::Next) return flow;
  }
  return Flow::Next;
}

Evaluator::Flow Evaluator::runStatement(const Statement& statement) {
  budget_.charge(1);
  line_ = statement.line;
  result_ = Value{};
  try {
    return std::visit([this](const auto& node) { return execute(node); }, statement.node);
  } catch (const Failure& failure) {
    if (ignoring_ == 0 || !failure.byApplication) throw;
    result_ = Value{};
    return Flow::Next;
  }
}

Evaluator::Flow Evaluator::execute(const Evaluate& node) {
  result_ = evaluate(node.value);
  return Flow::Next;
}

Evaluator::Flow Evaluator::execute(const SetVariable& node) {
  result_ = evaluatePresent(node.value);
  variables_[node.slot] = result_;
  return Flow::Next;
}

Evaluator::Flow Evaluator::execute(const SetProperty& node) {
  const Property& property = node.property;
  Value value = evaluateAs(node.value, property.term->type);
  if (property.container != kNone) {
    setProperty(evaluate(property.container), property.term->words, value);
  } else {
    const ObjectRef* const owner = findOwner(property.term->words);
    setProperty(owner == nullptr ? told() : *owner, property.term->words, value);
  }
  result_ = std::move(value);
  return Flow::Next;
}

Evaluator::Flow Evaluator::execute(const Tell& node) {
  const Value target = evaluate(node.target);
  const auto* object = std::get_if<ObjectRef>(&target);
  if (object == nullptr) throw Failure{"cannot tell " + std::string(kindName(target)) + " anything"};
  told_.push_back(*object);
  const AtEnd untell([this] { told_.pop_back(); });
  return runBody(node.body);
}

Evaluator::Flow Evaluator::execute(const If& node) {
  const If* branch = &node;
  for (;;) {
    if (truth(evaluate(branch->condition))) return runBody(branch->body);
    if (branch->elseIf == kNone) return runBody(branch->elseBody);
    const Statement& next = program_.statements[branch->elseIf];
    line_ = next.line;
    branch = &std::get<If>(next.node);
  }
}

Evaluator::Flow Evaluator::execute(const RepeatWhile& node) {
  const std::int32_t line = line_;
  for (;;) {
    budget_.charge(1);
    line_ = line;
    if (node.condition != kNone && truth(evaluate(node.condition)) != node.expected) return Flow::Next;
    const Flow flow = runBody(node.body);
    if (flow != Flow::Next) return flow == Flow::ExitRepeat ? Flow::Next : flow;
  }
}

Evaluator::Flow Evaluator::execute(const RepeatTimes& node) {
  for (std::int64_t left = evaluateWhole(node.count); left > 0; --left) {
    budget_.charge(1);
    const Flow flow = runBody(node.body);
    if (flow != Flow::Next) return flow == Flow::ExitRepeat ? Flow::Next : flow;
  }
  return Flow::Next;
}

Evaluator::Flow Evaluator::execute(const RepeatWith& node) {
  const std::int64_t from = evaluateWhole(node.from);
  const std::int64_t to = evaluateWhole(node.to);
  const std::int64_t by = node.by == kNone ? 1 : evaluateWhole(node.by);
  if (by == 0) throw Failure{"a repeat cannot go by 0"};
  for (std::int64_t i = from; by > 0 ? i <= to : i >= to;) {
    budget_.charge(1);
    variables_[node.slot] = i;
    const Flow flow = runBody(node.body);
    if (flow != Flow::Next) return flow == Flow::ExitRepeat ? Flow::Next : flow;
    if (__builtin_add_overflow(i, by, &i)) break;
  }
  return Flow::Next;
}

Evaluator::Flow Evaluator::execute(const ExitRepeat& /*node*/) { return Flow::ExitRepeat; }

Evaluator::Flow Evaluator::execute(const Ignoring& node) {
  ++ignoring_;
  const AtEnd heed([this] { --ignoring_; });
  return runBody(node.body);
}

Evaluator::Flow Evaluator::execute(const Return& node) {
  if (node.value != kNone) result_ = evaluate(node.value);
  return Flow::Return;
}

// ---- Expressions

Value Evaluator::evaluate(ExpressionRef expression) {
  budget_.charge(1);
  return std::visit([this](const auto& node) { return compute(node); }, program_.expressions[expression]);
}

Value Evaluator::evaluatePresent(ExpressionRef expression) {
  Value value = evaluate(expression);
  // Only an application can leave a value out.
  if (std::holds_alternative<std::monostate>(value)) throw Failure{"there is no value here", true};
  return value;
}

Value Evaluator::evaluateAs(ExpressionRef expression, Type wanted) {
  const Expression& node = program_.expressions[expression];
  const auto* property = std::get_if<Property>(&node);
  if (wanted != Type::Constant || property == nullptr) return evaluatePresent(expression);
  if (property->constant == nullptr || property->container != kNone) return evaluatePresent(expression);
  return Constant{property->constant->code};
}

std::int64_t Evaluator::evaluateWhole(ExpressionRef expression) {
  const Value value = evaluate(expression);
  const auto whole = wholeNumber(value);
  if (!whole) throw Failure{"expected a whole number, not " + std::string(kindName(value))};
  return *whole;
}

Value Evaluator::compute(const Literal& node) {
  budget_.chargeCopy(node.value);
  return node.value;
}

Value Evaluator::compute(const Variable& node) {
  const Value& value = variables_[node.slot];
  if (std::holds_alternative<std::monostate>(value)) {
    throw Failure{"the variable '" + program_.variables[node.slot] + "' is not set"};
  }
  budget_.chargeCopy(value);
  return value;
}

Value Evaluator::compute(const Count& node) {
  const Value value = evaluate(node.operand);
  if (const auto* list = std::get_if<List>(&value))
    return static_cast<std::int64_t>(elementsOf(*list).size());
  const auto* text = std::get_if<std::string>(&value);
  if (text == nullptr) throw Failure{"cannot count " + std::string(kindName(value))};
  return static_cast<std::int64_t>(text::characterCount(*text));
}

Value Evaluator::compute(const ListLiteral& node) {
  std::vector<Value> elements;
  elements.reserve(node.count);
  for (std::uint32_t i = 0; i < node.count; ++i) {
    elements.push_back(evaluatePresent(program_.operands[node.first + i]));
  }
  return makeList(std::move(elements), budget_);
}

Value Evaluator::compute(const Negation& node) { return negate(evaluate(node.operand)); }

Value Evaluator::compute(const Not& node) { return !truth(evaluate(node.operand)); }

Value Evaluator::compute(const Binary& node) {
  const Value left = evaluate(node.left);
  if (node.op == Operator::And) return truth(left) && truth(evaluate(node.right));
  if (node.op == Operator::Or) return truth(left) || truth(evaluate(node.right));
  if (node.op == Operator::Equal || node.op == Operator::NotEqual) {
    if (const auto named = isNamed(left, node.right)) return *named == (node.op == Operator::Equal);
  }
  return apply(node.op, left, evaluate(node.right), budget_);
}

}  // namespace tarnscript
