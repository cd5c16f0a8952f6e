// Tokens and words first, which everything else uses; then the statements in the order of their importance.
#include <utility>

#include "platform/tarnscript/parser.h"

namespace tarnscript {

Parser::Nested::Nested(Parser& parser) : parser_(parser) {
  if (parser_.depth_ >= kMaxNesting) parser_.fail("the script is nested too deeply");
  ++parser_.depth_;
}

Parser::Parser(std::span<const Token> tokens, World& world)
    : tokens_(tokens), world_(world), additions_(&vocabularyOf(world.additions())) {
  program_.expressions.reserve(tokens.size());
  heights_.reserve(tokens.size());
}

Program Parser::parse() {
  program_.body = parseBody();
  if (token().kind != TokenKind::EndOfSource) failExpecting("a statement");
  return std::move(program_);
}

bool Parser::accept(TokenKind kind) {
  if (token().kind != kind) return false;
  ++position_;
  return true;
}

bool Parser::accept(Keyword keyword) {
  if (token().keyword != keyword) return false;
  ++position_;
  return true;
}

bool Parser::acceptWord(std::string_view word) {
  if (matchWords(rest(), word) == 0) return false;
  ++position_;
  return true;
}

void Parser::expect(TokenKind kind, const char* what) {
  if (!accept(kind)) failExpecting(what);
}

void Parser::expect(Keyword keyword, const char* what) {
  if (!accept(keyword)) failExpecting(what);
}

void Parser::fail(const std::string& message) const { throw Error{message, token().line}; }

void Parser::failExpecting(const std::string& what) const {
  switch (token().kind) {
    case TokenKind::EndOfSource:
      fail("expected " + what + ", found the end of the script");
    case TokenKind::EndOfLine:
      fail("expected " + what + ", found the end of the line");
    default:
      fail("expected " + what + ", found '" + std::string(token().text) + "'");
  }
}

Matches Parser::lookUp() const {
  Matches matches;
  if (told_ != nullptr) told_->match(rest(), matches);
  additions_->match(rest(), matches);
  return matches;
}

Keyword Parser::keyword() const {
  const Keyword written = token().keyword;
  return written == Keyword::None || lookUp().longest() > 1 ? Keyword::None : written;
}

bool Parser::atVariable() const {
  return token().kind == TokenKind::Word && token().keyword == Keyword::None && lookUp().longest() == 0;
}

const Vocabulary& Parser::vocabularyOf(Application& application) {
  for (const Vocabulary& vocabulary : vocabularies_) {
    if (&vocabulary.application() == &application) return vocabulary;
  }
  return vocabularies_.emplace_back(application);
}

std::uint32_t Parser::slotOf(std::string_view variable) {
  const auto [at, isNew] = slots_.try_emplace(variable, static_cast<std::uint32_t>(slots_.size()));
  if (isNew) program_.variables.emplace_back(variable);
  return at->second;
}

/// Statements up to what closes them ("end", "else", the end of the source), which is left standing.
StatementRef Parser::parseBody() {
  StatementRef first = kNone;
  StatementRef last = kNone;
  for (;;) {
    while (accept(TokenKind::EndOfLine)) {
    }
    const Keyword here = keyword();
    if (token().kind == TokenKind::EndOfSource || here == Keyword::End || here == Keyword::Else) return first;
    const StatementRef statement = parseStatement();
    if (token().kind != TokenKind::EndOfLine) failExpecting("the end of the line");
    if (first == kNone) {
      first = statement;
    } else {
      program_.statements[last].next = statement;
    }
    last = statement;
  }
}

/// "end", alone or with the word that opened the block.
void Parser::parseEnd(Keyword block, const char* what) {
  expect(Keyword::End, what);
  if (token().kind != TokenKind::EndOfLine) expect(block, what);
}

StatementRef Parser::parseStatement() {
  const Nested nested(*this);
  const std::int32_t line = token().line;
  switch (keyword()) {
    case Keyword::Tell:
      return parseTell();
    case Keyword::If:
      return parseIf();
    case Keyword::Repeat:
      return parseRepeat();
    case Keyword::Ignoring:
      return parseIgnoring();
    case Keyword::Set:
      return parseSet();
    case Keyword::Launch:
      return parseStart(false);
    case Keyword::Activate:
      return parseStart(true);
    case Keyword::Return:
      ++position_;
      return addStatement(line, Return{startsValue() ? parseExpression() : kNone});
    case Keyword::Exit:
      ++position_;
      expect(Keyword::Repeat, "'repeat'");
      if (repeats_ == 0) fail("'exit repeat' stands outside a repeat");
      return addStatement(line, ExitRepeat{});
    default:
      return parseEvaluate();
  }
}

StatementRef Parser::parseTell() {
  const std::int32_t line = token().line;
  ++position_;
  const ExpressionRef target = parseExpression();

  const Vocabulary* const outer = told_;
  if (const auto* literal = std::get_if<Literal>(&program_.expressions[target])) {
    const auto* object = std::get_if<ObjectRef>(&literal->value);
    if (object == nullptr) fail("only an application or one of its objects can be told");
    told_ = &vocabularyOf(*object->application);
  }
  StatementRef body = kNone;
  if (accept(Keyword::To)) {
    body = parseStatement();
  } else {
    expect(TokenKind::EndOfLine, "'to' or the end of the line");
    body = parseBody();
    parseEnd(Keyword::Tell, "'end tell'");
  }
  told_ = outer;
  return addStatement(line, Tell{target, body});
}

StatementRef Parser::parseIf() {
  StatementRef first = kNone;
  StatementRef last = kNone;
  for (;;) {
    const std::int32_t line = token().line;
    ++position_;
    const ExpressionRef condition = parseExpression();
    const bool hasThen = accept(Keyword::Then);
    if (first == kNone && hasThen && token().kind != TokenKind::EndOfLine) {
      const StatementRef body = parseStatement();
      const StatementRef otherwise = accept(Keyword::Else) ? parseStatement() : kNone;
      return addStatement(line, If{condition, body, kNone, otherwise});
    }
    expect(TokenKind::EndOfLine, hasThen ? "the end of the line" : "'then'");
    const StatementRef branch = addStatement(line, If{condition, parseBody(), kNone, kNone});
    if (first == kNone) {
      first = branch;
    } else {
      std::get<If>(program_.statements[last].node).elseIf = branch;
    }
    last = branch;
    if (!accept(Keyword::Else)) break;
    if (token().keyword == Keyword::If) continue;
    expect(TokenKind::EndOfLine, "'if' or the end of the line");
    const StatementRef otherwise = parseBody();
    std::get<If>(program_.statements[last].node).elseBody = otherwise;
    break;
  }
  parseEnd(Keyword::If, "'end if'");
  return first;
}

StatementRef Parser::parseRepeat() {
  const std::int32_t line = token().line;
  ++position_;
  if (accept(Keyword::With)) return parseRepeatWith();
  if (token().kind == TokenKind::EndOfLine) {
    return addStatement(line, RepeatWhile{kNone, true, parseRepeatBody()});
  }
  const bool isWhile = acceptWord("while");
  if (isWhile || acceptWord("until")) {
    const ExpressionRef condition = parseExpression();
    return addStatement(line, RepeatWhile{condition, isWhile, parseRepeatBody()});
  }
  const ExpressionRef count = parseExpression();
  if (!acceptWord("times")) failExpecting("'times'");
  return addStatement(line, RepeatTimes{count, parseRepeatBody()});
}

/// "with i from a to b by s", from the variable on.
StatementRef Parser::parseRepeatWith() {
  const std::int32_t line = token().line;
  if (!atVariable()) failExpecting("a variable");
  RepeatWith repeat{slotOf(token().text), kNone, kNone, kNone, kNone};
  ++position_;
  if (!acceptWord("from")) failExpecting("'from'");
  repeat.from = parseExpression();
  expect(Keyword::To, "'to'");
  repeat.to = parseExpression();
  if (acceptWord("by")) repeat.by = parseExpression();
  repeat.body = parseRepeatBody();
  return addStatement(line, repeat);
}

StatementRef Parser::parseRepeatBody() {
  expect(TokenKind::EndOfLine, "the end of the line");
  ++repeats_;
  const StatementRef body = parseBody();
  --repeats_;
  parseEnd(Keyword::Repeat, "'end repeat'");
  return body;
}

StatementRef Parser::parseIgnoring() {
  const std::int32_t line = token().line;
  ++position_;
  if (matchWords(rest(), "application responses") == 0) failExpecting("'application responses'");
  position_ += 2;
  expect(TokenKind::EndOfLine, "the end of the line");
  const StatementRef body = parseBody();
  parseEnd(Keyword::Ignoring, "'end ignoring'");
  return addStatement(line, Ignoring{body});
}

StatementRef Parser::parseSet() {
  const std::int32_t line = token().line;
  ++position_;
  const ExpressionRef target = parseOperand();
  if (std::holds_alternative<Variable>(program_.expressions[target])) {
    expect(Keyword::To, "'to'");
    const std::uint32_t slot = std::get<Variable>(program_.expressions[target]).slot;
    return addStatement(line, SetVariable{slot, parseExpression()});
  }
  if (!std::holds_alternative<Property>(program_.expressions[target])) {
    fail("only a variable or a property can be set");
  }
  expect(Keyword::To, "'to'");
  const Property property = std::get<Property>(program_.expressions[target]);
  return addStatement(line, SetProperty{property, parseExpression()});
}

StatementRef Parser::parseStart(bool activates) {
  const std::int32_t line = token().line;
  ++position_;
  return addStatement(line, Start{activates, startsValue() ? parseOperand() : kNone});
}

/// A command or a value that stands alone. A command wins over other terms of the same length here.
StatementRef Parser::parseEvaluate() {
  const std::int32_t line = token().line;
  const Matches found = lookUp();
  const bool isCommand = found.command.length != 0 && found.command.length == found.longest();
  if (isCommand && keyword() == Keyword::None) return addStatement(line, Evaluate{parseCommand(found)});
  return addStatement(line, Evaluate{parseExpression()});
}

}  // namespace tarnscript
