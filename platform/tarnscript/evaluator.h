// Runs a Program. Statements and operators are in evaluator.cpp; what reaches applications, in
// evaluator_objects.cpp.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

#include "platform/tarnscript/syntax.h"
#include "platform/tarnscript/values.h"

namespace tarnscript {

class Evaluator {
 public:
  /// Both must outlive the evaluator.
  Evaluator(const Program& program, World& world);

  /// Runs the program once, to its end or to its first failure.
  Outcome run();

 private:
  /// What a statement makes of those behind it.
  enum class Flow { Next, ExitRepeat, Return };

  // ---- Statements; each leaves its value in result_, or none.
  Flow runBody(StatementRef first);
  Flow runStatement(const Statement& statement);
  Flow execute(const Evaluate& node);
  Flow execute(const SetVariable& node);
  Flow execute(const SetProperty& node);
  Flow execute(const Tell& node);
  Flow execute(const If& node);
  Flow execute(const RepeatWhile& node);
  Flow execute(const RepeatTimes& node);
  Flow execute(const RepeatWith& node);
  Flow execute(const ExitRepeat& node);
  Flow execute(const Ignoring& node);
  Flow execute(const Return& node);
  Flow execute(const Start& node);

  // ---- Expressions
  Value evaluate(ExpressionRef expression);
  /// As evaluate; throws Failure when there is no value.
  Value evaluatePresent(ExpressionRef expression);
  /// Of a word that is a property and a constant, the constant where constants are wanted.
  Value evaluateAs(ExpressionRef expression, Type wanted);
  std::int64_t evaluateWhole(ExpressionRef expression);
  Value compute(const Literal& node);
  Value compute(const Variable& node);
  Value compute(const It& node);
  Value compute(const Property& node);
  Value compute(const Element& node);
  Value compute(const Count& node);
  Value compute(const ListLiteral& node);
  Value compute(const Negation& node);
  Value compute(const Not& node);
  Value compute(const Binary& node);
  Value compute(const Command& node);
  std::optional<bool> isNamed(const Value& left, ExpressionRef right);

  // ---- Objects
  const ObjectRef& told() const;
  /// The property of these words that the object's own application gives its class; null when there is none.
  static const PropertyTerm* findProperty(const ObjectRef& object, std::string_view words);
  /// The told object, from the innermost outward, that has the property; null when none has.
  const ObjectRef* findOwner(std::string_view words) const;
  Value getProperty(const Value& container, std::string_view words);
  Value getField(const Record& record, std::string_view words);
  void setProperty(const Value& container, std::string_view words, const Value& value);
  Value selectFrom(const List& list, const Element& node);
  Value selectFrom(const ObjectRef& container, const Element& node);
  /// Which of `count` elements is meant, from 0; none when it is not there.
  std::optional<std::size_t> indexOf(const Element& node, std::size_t count);
  /// Puts a question or an event to an application. Throws Failure when it does not run or refuses.
  template <typename Action>
  auto ask(Application& application, Action action) {
    try {
      if (!application.running()) throw Failure{"the application is not running", true};
      application.deliver(ignoring_ == 0);
      return action();
    } catch (const Refusal& refusal) {
      throw Failure{refusal.message, true};
    }
  }

  const Program& program_;
  Application& additions_;
  Budget budget_;
  std::vector<Value> variables_;
  /// What the open tells are about, the innermost last.
  std::vector<ObjectRef> told_;
  int ignoring_ = 0;
  std::int32_t line_ = 0;
  Value result_;
};

}  // namespace tarnscript
