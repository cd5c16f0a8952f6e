// Top-down: operators, prefixes, operands with their "of" chains, then what an operand can be.
#include <algorithm>
#include <array>
#include <charconv>
#include <utility>

#include "platform/tarnscript/parser.h"

namespace tarnscript {

namespace {

/// How tightly each operator binds; "not" stands between "and" and the comparisons.
constexpr int precedenceOf(Operator op) {
  switch (op) {
    case Operator::Or:
      return 1;
    case Operator::And:
      return 2;
    case Operator::Equal:
    case Operator::NotEqual:
      return 3;
    case Operator::Less:
    case Operator::LessOrEqual:
    case Operator::Greater:
    case Operator::GreaterOrEqual:
      return 4;
    case Operator::Concatenate:
      return 5;
    case Operator::Add:
    case Operator::Subtract:
      return 6;
    default:
      return 7;
  }
}

constexpr auto kSymbolOperators = std::to_array<std::pair<TokenKind, Operator>>({
    {TokenKind::Equal, Operator::Equal},
    {TokenKind::NotEqual, Operator::NotEqual},
    {TokenKind::Less, Operator::Less},
    {TokenKind::LessOrEqual, Operator::LessOrEqual},
    {TokenKind::Greater, Operator::Greater},
    {TokenKind::GreaterOrEqual, Operator::GreaterOrEqual},
    {TokenKind::Concatenate, Operator::Concatenate},
    {TokenKind::Plus, Operator::Add},
    {TokenKind::Minus, Operator::Subtract},
    {TokenKind::Times, Operator::Multiply},
    {TokenKind::Divide, Operator::Divide},
});

/// The operators in words, each before those that begin it.
constexpr auto kWordOperators = std::to_array<std::pair<std::string_view, Operator>>({
    {"is not equal to", Operator::NotEqual},
    {"is not", Operator::NotEqual},
    {"is equal to", Operator::Equal},
    {"is greater than or equal to", Operator::GreaterOrEqual},
    {"is greater than", Operator::Greater},
    {"is less than or equal to", Operator::LessOrEqual},
    {"is less than", Operator::Less},
    {"is", Operator::Equal},
    {"equals", Operator::Equal},
    {"or", Operator::Or},
    {"and", Operator::And},
    {"div", Operator::IntegerDivide},
    {"mod", Operator::Modulo},
});

struct FoundOperator {
  Operator op = Operator::Or;
  std::size_t length = 0;
};

FoundOperator findOperator(std::span<const Token> tokens) {
  if (tokens.front().kind == TokenKind::Word) {
    // Every operator in words starts with a keyword, which rules most words out at once.
    if (tokens.front().keyword == Keyword::None) return {};
    for (const auto& [words, op] : kWordOperators) {
      if (const std::size_t length = matchWords(tokens, words)) return {op, length};
    }
    return {};
  }
  for (const auto& [kind, op] : kSymbolOperators) {
    if (tokens.front().kind == kind) return {op, 1};
  }
  return {};
}

/// The elements of lists, the one class that is the language's own.
constexpr ClassTerm kItem = {"item", "items", kItemClass};

}  // namespace

void Parser::raise(int& height, ExpressionRef operand) const {
  if (operand != kNone) height = std::max(height, heights_[operand] + 1);
}

ExpressionRef Parser::add(Expression expression, std::initializer_list<ExpressionRef> operands) {
  int height = 1;
  for (const ExpressionRef operand : operands) raise(height, operand);
  if (const auto* list = std::get_if<ListLiteral>(&expression)) {
    for (std::uint32_t i = 0; i < list->count; ++i) raise(height, program_.operands[list->first + i]);
  } else if (const auto* command = std::get_if<Command>(&expression)) {
    for (std::uint32_t i = 0; i < command->argumentCount; ++i) {
      raise(height, program_.arguments[command->firstArgument + i].value);
    }
  }
  // A long chain of operators nests as deeply as parentheses do, though parsing it needs no recursion.
  if (height > kMaxNesting) fail("the expression is nested too deeply");
  program_.expressions.push_back(std::move(expression));
  heights_.push_back(height);
  return static_cast<ExpressionRef>(program_.expressions.size() - 1);
}

ExpressionRef Parser::parseExpression(int minimum) {
  const Nested nested(*this);
  ExpressionRef left = parsePrefix();
  for (;;) {
    const auto [op, length] = findOperator(rest());
    if (length == 0 || precedenceOf(op) < minimum) return left;
    position_ += length;
    const ExpressionRef right = parseExpression(precedenceOf(op) + 1);
    left = add(Binary{op, left, right}, {left, right});
  }
}

ExpressionRef Parser::parsePrefix() {
  if (startsNumber()) return parseNumber();
  if (accept(TokenKind::Minus)) {
    const Nested nested(*this);
    const ExpressionRef operand = parsePrefix();
    return add(Negation{operand}, {operand});
  }
  switch (keyword()) {
    case Keyword::Not: {
      ++position_;
      const ExpressionRef operand = parseExpression(precedenceOf(Operator::Equal));
      return add(Not{operand}, {operand});
    }
    case Keyword::Get:
      while (keyword() == Keyword::Get) ++position_;
      return parseExpression();
    case Keyword::Count: {
      ++position_;
      accept(Keyword::Of);
      const ExpressionRef operand = parseOperand();
      return add(Count{operand}, {operand});
    }
    default:
      return parseOperand();
  }
}

ExpressionRef Parser::parseOperand() {
  ExpressionRef operand = parsePrimary();
  while (accept(TokenKind::Possessive)) operand = parseReference(operand);
  return operand;
}

ExpressionRef Parser::parsePrimary() {
  switch (token().kind) {
    case TokenKind::Word:
      return parseWord();
    case TokenKind::Text:
      return add(Literal{parseText()});
    case TokenKind::Integer:
    case TokenKind::Real:
      return parseNumber();
    case TokenKind::OpenBrace:
      return parseList();
    case TokenKind::OpenParenthesis: {
      ++position_;
      const ExpressionRef inner = parseExpression();
      expect(TokenKind::CloseParenthesis, "')'");
      return inner;
    }
    default:
      failExpecting("a value");
  }
}

ExpressionRef Parser::parseWord() {
  switch (keyword()) {
    case Keyword::None:
      break;
    case Keyword::True:
    case Keyword::False:
      return add(Literal{tokens_[position_++].keyword == Keyword::True});
    case Keyword::It:
      ++position_;
      return add(It{});
    case Keyword::Its:
      ++position_;
      return parseReference(add(It{}));
    case Keyword::Application:
      return parseApplication();
    case Keyword::First:
    case Keyword::Last:
    case Keyword::Every:
    case Keyword::Item:
      return parseReference(kNone);
    default:
      failExpecting("a value");
  }
  const Matches found = lookUp();
  const std::size_t longest = found.longest();
  if (longest == 0) {
    const std::uint32_t slot = slotOf(token().text);
    ++position_;
    return add(Variable{slot});
  }
  if (found.property.length == longest || found.cls.length == longest) return parseReference(kNone);
  if (found.constant.length == longest) {
    position_ += longest;
    return add(Literal{Constant{found.constant.term->code}});
  }
  return parseCommand(found);
}

bool Parser::startsNumber() const {
  const TokenKind kind = rest()[token().kind == TokenKind::Minus ? 1 : 0].kind;
  return kind == TokenKind::Integer || kind == TokenKind::Real;
}

ExpressionRef Parser::parseNumber() {
  const bool isNegative = accept(TokenKind::Minus);
  const std::string_view digits = token().text;
  const char* const end = digits.data() + digits.size();
  Value value;
  std::int64_t integer = 0;
  if (token().kind == TokenKind::Integer && std::from_chars(digits.data(), end, integer).ec == std::errc()) {
    value = integer;
  } else {
    double real = 0;
    if (std::from_chars(digits.data(), end, real).ec != std::errc()) fail("the number is out of range");
    value = real;
  }
  ++position_;
  return add(Literal{isNegative ? negate(value) : value});
}

std::string Parser::parseText() {
  const std::string_view written = token().text;
  std::string text;
  text.reserve(written.size());
  for (std::size_t i = 0; i < written.size(); ++i) {
    if (written[i] != '\\') {
      text += written[i];
      continue;
    }
    constexpr std::string_view kEscapes = "\"\\ntr";
    constexpr std::string_view kMeanings = "\"\\\n\t\r";
    const std::size_t escape = kEscapes.find(written[++i]);
    if (escape == std::string_view::npos) fail("a text holds an unknown escape");
    text += kMeanings[escape];
  }
  ++position_;
  return text;
}

ExpressionRef Parser::parseList() {
  ++position_;
  std::vector<ExpressionRef> operands;
  if (token().kind != TokenKind::CloseBrace) {
    do {
      operands.push_back(parseExpression());
    } while (accept(TokenKind::Comma));
  }
  expect(TokenKind::CloseBrace, "'}'");
  const ListLiteral list{static_cast<std::uint32_t>(program_.operands.size()),
                         static_cast<std::uint32_t>(operands.size())};
  program_.operands.insert(program_.operands.end(), operands.begin(), operands.end());
  return add(list);
}

/// "application "name"" or "application id "identifier"", a text that is known now.
ExpressionRef Parser::parseApplication() {
  ++position_;
  acceptWord("id");
  if (token().kind != TokenKind::Text) failExpecting("the application's name or identifier as a text");
  const std::int32_t line = token().line;
  const std::string name = parseText();
  Application* const application = world_.find(name);
  if (application == nullptr) throw Error{"application \"" + name + "\" is not installed", line};
  return add(Literal{ObjectRef{application, kApplicationClass, 0}});
}

ExpressionRef Parser::parseReference(ExpressionRef container) {
  Expression part = parsePart();
  if (container == kNone && accept(Keyword::Of)) {
    const Nested nested(*this);
    container = parseOperand();
  }
  if (auto* property = std::get_if<Property>(&part)) {
    property->container = container;
    return add(*property, {container});
  }
  auto element = std::get<Element>(part);
  element.container = container;
  return add(element, {element.selector, container});
}

/// A property or an element, its container still open.
Expression Parser::parsePart() {
  const auto selected = [this](Selection selection) {
    ++position_;
    const Found<ClassTerm> cls = findClass();
    position_ += cls.length;
    return Element{cls.term, selection, kNone, kNone};
  };
  switch (keyword()) {
    case Keyword::First:
      return selected(Selection::First);
    case Keyword::Last:
      return selected(Selection::Last);
    case Keyword::Every:
      return selected(Selection::Every);
    case Keyword::Item:
      return parseElement(findClass(), false);
    case Keyword::None:
      break;
    default:
      failExpecting("a property or an element");
  }
  const Matches found = lookUp();
  const std::size_t propertyLength = found.property.length;
  const std::size_t classLength = found.cls.length;
  if (propertyLength == 0 && classLength == 0) failExpecting("a property or an element");
  // "chapter" can be both; a number behind it makes it the class.
  const TokenKind next = rest()[classLength].kind;
  const bool isNumbered = !found.plural && (next == TokenKind::Integer || next == TokenKind::OpenParenthesis);
  if (classLength > propertyLength || (classLength == propertyLength && isNumbered)) {
    return parseElement(found.cls, found.plural);
  }
  position_ += propertyLength;
  const bool isConstantToo = found.constant.length == propertyLength;
  return Property{found.property.term, isConstantToo ? found.constant.term : nullptr, kNone};
}

Found<ClassTerm> Parser::findClass() const {
  if (keyword() == Keyword::Item) return {&kItem, 1};
  const Found<ClassTerm> found = lookUp().cls;
  if (found.length == 0) failExpecting("a class of objects");
  return found;
}

Element Parser::parseElement(Found<ClassTerm> cls, bool plural) {
  position_ += cls.length;
  if (plural) return {cls.term, Selection::Every, kNone, kNone};
  const Selection selection = acceptWord("id") ? Selection::ID : Selection::Index;
  return {cls.term, selection, parseSelector(), kNone};
}

/// Which element: a number, a text, a variable or anything in parentheses.
ExpressionRef Parser::parseSelector() {
  if (startsNumber()) return parseNumber();
  const TokenKind kind = token().kind;
  if (kind != TokenKind::Text && kind != TokenKind::OpenParenthesis && !atVariable()) {
    failExpecting("the number of an element");
  }
  return parsePrimary();
}

ExpressionRef Parser::parseCommand(const Matches& found) {
  position_ += found.command.length;
  Command command{found.command.term, found.commandVocabulary == additions_, kNone, 0, 0};
  if (command.term->takesDirect && startsValue() && findParameter(found).length == 0) {
    command.direct = parseExpression();
  }
  std::vector<Argument> arguments;
  while (parseArgument(found, arguments)) {
  }
  command.firstArgument = static_cast<std::uint32_t>(program_.arguments.size());
  command.argumentCount = static_cast<std::uint32_t>(arguments.size());
  program_.arguments.insert(program_.arguments.end(), arguments.begin(), arguments.end());
  return add(command, {command.direct});
}

/// "P value", "with P and Q" or "without P"; false where none stands.
bool Parser::parseArgument(const Matches& found, std::vector<Argument>& arguments) {
  if (const auto parameter = findParameter(found); parameter.length != 0) {
    position_ += parameter.length;
    arguments.push_back({parameter.term, parseExpression()});
    return true;
  }
  const bool on = accept(Keyword::With);
  if (!on && !accept(Keyword::Without)) return false;
  do {
    arguments.push_back(parseSwitch(found, on));
  } while (accept(Keyword::And) || accept(TokenKind::Comma));
  return true;
}

Argument Parser::parseSwitch(const Matches& found, bool on) {
  const auto parameter = findParameter(found);
  const bool isBoolean = parameter.length != 0 && parameter.term->type == Type::Boolean;
  if (!isBoolean) failExpecting("a parameter that is true or false");
  position_ += parameter.length;
  return {parameter.term, add(Literal{on})};
}

Found<ParameterTerm> Parser::findParameter(const Matches& found) const {
  Found<ParameterTerm> longest;
  if (token().kind != TokenKind::Word) return longest;
  for (const ParameterTerm& parameter : found.commandVocabulary->dictionary().parameters) {
    if (parameter.command != found.command.term->code) continue;
    const std::size_t length = matchWords(rest(), parameter.words);
    if (length > longest.length) longest = {&parameter, length};
  }
  return longest;
}

bool Parser::startsValue() const {
  switch (token().kind) {
    case TokenKind::Text:
    case TokenKind::Integer:
    case TokenKind::Real:
    case TokenKind::OpenParenthesis:
    case TokenKind::OpenBrace:
    case TokenKind::Minus:
      return true;
    case TokenKind::Word:
      break;
    default:
      return false;
  }
  switch (keyword()) {
    case Keyword::None:
    case Keyword::Application:
    case Keyword::Count:
    case Keyword::Every:
    case Keyword::False:
    case Keyword::First:
    case Keyword::Get:
    case Keyword::It:
    case Keyword::Item:
    case Keyword::Its:
    case Keyword::Last:
    case Keyword::Not:
    case Keyword::True:
      return true;
    default:
      return false;
  }
}

}  // namespace tarnscript
