// The compiled form of a script: expressions and statements in two arrays, referring to each other by
// position.
#pragma once

#include <cstdint>
#include <string>
#include <variant>
#include <vector>

#include "platform/tarnscript/tarnscript.h"
#include "platform/tarnscript/values.h"

namespace tarnscript {

/// Positions in Program::expressions and Program::statements; kNone where nothing was written.
using ExpressionRef = std::uint32_t;
using StatementRef = std::uint32_t;
inline constexpr std::uint32_t kNone = 0xFFFFFFFF;

/// The class code of "item", the elements of a list; no application is asked for them.
inline constexpr Code kItemClass = code("cobj");

// ---- Expressions

struct Literal {
  Value value;
};

struct Variable {
  std::uint32_t slot;
};

/// What the innermost tell is about.
struct It {};

/// "rate of X"; without a container, of the nearest told object that has one.
struct Property {
  const PropertyTerm* term;
  /// A constant of the same words; what it is shows when its neighbour's value is known.
  const ConstantTerm* constant;
  ExpressionRef container;
};

enum class Selection : std::uint8_t { First, Last, Every, Index, ID };

/// "album 1", "front document", "every album of X"; without a container, of what the tell is about.
struct Element {
  const ClassTerm* cls;
  Selection selection;
  ExpressionRef selector;
  ExpressionRef container;
};

struct Count {
  ExpressionRef operand;
};

/// "{a, b}": a range of Program::operands.
struct ListLiteral {
  std::uint32_t first;
  std::uint32_t count;
};

struct Negation {
  ExpressionRef operand;
};

struct Not {
  ExpressionRef operand;
};

struct Binary {
  Operator op;
  ExpressionRef left;
  ExpressionRef right;
};

struct Argument {
  const ParameterTerm* term;
  ExpressionRef value;
};

/// A dictionary's command; its arguments are a range of Program::arguments.
struct Command {
  const CommandTerm* term;
  /// From the additions, not from the application that is told.
  bool addition;
  ExpressionRef direct;
  std::uint32_t firstArgument;
  std::uint32_t argumentCount;
};

using Expression = std::variant<Literal, Variable, It, Property, Element, Count, ListLiteral, Negation, Not,
                                Binary, Command>;

// ---- Statements. A body is its first statement, each naming the next.

struct Evaluate {
  ExpressionRef value;
};

struct SetVariable {
  std::uint32_t slot;
  ExpressionRef value;
};

struct SetProperty {
  Property property;
  ExpressionRef value;
};

struct Tell {
  ExpressionRef target;
  StatementRef body;
};

struct If {
  ExpressionRef condition;
  StatementRef body;
  /// The If of an "else if", or the body of an "else"; at most one of the two.
  StatementRef elseIf;
  StatementRef elseBody;
};

/// "repeat while", "repeat until"; without a condition, for ever.
struct RepeatWhile {
  ExpressionRef condition;
  bool expected;
  StatementRef body;
};

struct RepeatTimes {
  ExpressionRef count;
  StatementRef body;
};

struct RepeatWith {
  std::uint32_t slot;
  ExpressionRef from;
  ExpressionRef to;
  ExpressionRef by;
  StatementRef body;
};

struct ExitRepeat {};

/// "ignoring application responses".
struct Ignoring {
  StatementRef body;
};

struct Return {
  ExpressionRef value;
};

/// "launch" and "activate", of the application named or of the one that is told.
struct Start {
  bool activates;
  ExpressionRef application;
};

struct Statement {
  std::variant<Evaluate, SetVariable, SetProperty, Tell, If, RepeatWhile, RepeatTimes, RepeatWith, ExitRepeat,
               Ignoring, Return, Start>
      node;
  std::int32_t line;
  StatementRef next;
};

struct Program {
  std::vector<Expression> expressions;
  std::vector<Statement> statements;
  std::vector<ExpressionRef> operands;
  std::vector<Argument> arguments;
  /// By slot, as they were first written.
  std::vector<std::string> variables;
  StatementRef body = kNone;
};

}  // namespace tarnscript
