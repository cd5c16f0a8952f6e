// From tokens to a Program, by recursive descent: statements in parser_statements.cpp, expressions in
// parser_expressions.cpp. The dictionaries of the applications named are consulted on the way, because only
// they tell where "show last slide of first slideshow" has its seams.
#pragma once

#include <deque>
#include <initializer_list>
#include <span>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "platform/tarnscript/lexer.h"
#include "platform/tarnscript/syntax.h"
#include "platform/tarnscript/vocabulary.h"
#include "platform/text/case.h"

namespace tarnscript {

class Parser {
 public:
  /// The tokens must come from tokenize and, like the world, outlive the parser.
  Parser(std::span<const Token> tokens, World& world);

  /// Parses the whole script. Throws Error where the grammar cannot go on.
  Program parse();

 private:
  /// One level of recursion; throws Error when there are too many.
  class Nested {
   public:
    explicit Nested(Parser& parser);
    ~Nested() { --parser_.depth_; }
    Nested(const Nested&) = delete;
    Nested& operator=(const Nested&) = delete;

   private:
    Parser& parser_;
  };

  // ---- Tokens
  const Token& token() const { return tokens_[position_]; }
  std::span<const Token> rest() const { return tokens_.subspan(position_); }
  bool accept(TokenKind kind);
  bool accept(Keyword keyword);
  bool acceptWord(std::string_view word);
  void expect(TokenKind kind, const char* what);
  void expect(Keyword keyword, const char* what);
  [[noreturn]] void fail(const std::string& message) const;
  [[noreturn]] void failExpecting(const std::string& what) const;

  // ---- Words
  /// What the dictionaries in force know here.
  Matches lookUp() const;
  /// The keyword here, unless a longer term of a dictionary starts with it ("get volume settings").
  Keyword keyword() const;
  /// Whether an unknown word stands here, which is a variable.
  bool atVariable() const;
  const Vocabulary& vocabularyOf(Application& application);
  std::uint32_t slotOf(std::string_view variable);

  // ---- Statements
  StatementRef parseStatement();
  StatementRef parseBody();
  void parseEnd(Keyword block, const char* what);
  StatementRef parseTell();
  StatementRef parseIf();
  StatementRef parseRepeat();
  StatementRef parseRepeatWith();
  StatementRef parseRepeatBody();
  StatementRef parseIgnoring();
  StatementRef parseSet();
  StatementRef parseStart(bool activates);
  StatementRef parseEvaluate();
  template <typename Node>
  StatementRef addStatement(std::int32_t line, Node node) {
    program_.statements.push_back(Statement{node, line, kNone});
    return static_cast<StatementRef>(program_.statements.size() - 1);
  }

  // ---- Expressions
  /// Operators that bind at least this tightly.
  ExpressionRef parseExpression(int minimum = 0);
  ExpressionRef parsePrefix();
  /// A value with its "of" and "'s" chain.
  ExpressionRef parseOperand();
  ExpressionRef parsePrimary();
  ExpressionRef parseWord();
  ExpressionRef parseNumber();
  ExpressionRef parseList();
  ExpressionRef parseApplication();
  std::string parseText();
  /// A property or element; of `container`, or of what follows "of".
  ExpressionRef parseReference(ExpressionRef container);
  Expression parsePart();
  Element parseElement(Found<ClassTerm> cls, bool plural);
  ExpressionRef parseSelector();
  Found<ClassTerm> findClass() const;
  ExpressionRef parseCommand(const Matches& found);
  bool parseArgument(const Matches& found, std::vector<Argument>& arguments);
  Argument parseSwitch(const Matches& found, bool on);
  Found<ParameterTerm> findParameter(const Matches& found) const;
  bool startsValue() const;
  bool startsNumber() const;
  /// Adds an expression over these operands.
  ExpressionRef add(Expression expression, std::initializer_list<ExpressionRef> operands = {});
  void raise(int& height, ExpressionRef operand) const;

  std::span<const Token> tokens_;
  World& world_;
  std::size_t position_ = 0;
  int depth_ = 0;
  int repeats_ = 0;
  Program program_;
  /// By ExpressionRef: the levels below each expression, itself included.
  std::vector<int> heights_;
  std::deque<Vocabulary> vocabularies_;
  const Vocabulary* additions_;
  /// Of the application that the innermost tell is about; null outside.
  const Vocabulary* told_ = nullptr;

  struct FoldedHash {
    std::size_t operator()(std::string_view word) const { return text::foldedHash(word); }
  };
  struct FoldedEqual {
    bool operator()(std::string_view a, std::string_view b) const { return text::equalIgnoringCase(a, b); }
  };
  std::unordered_map<std::string_view, std::uint32_t, FoldedHash, FoldedEqual> slots_;
};

}  // namespace tarnscript
