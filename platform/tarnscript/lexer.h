// From source text to tokens. Blanks, comments and the noise word "the" are gone afterwards; line ends stay,
// because a line is a statement.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace tarnscript {

enum class TokenKind : std::uint8_t {
  Word,
  Text,
  Integer,
  Real,
  OpenParenthesis,
  CloseParenthesis,
  OpenBrace,
  CloseBrace,
  Comma,
  Possessive,
  Plus,
  Minus,
  Times,
  Divide,
  Concatenate,
  Equal,
  NotEqual,
  Less,
  LessOrEqual,
  Greater,
  GreaterOrEqual,
  EndOfLine,
  EndOfSource,
};

/// The words that are the language's own everywhere. Words that mean something in one place only ("times",
/// "from", "id") are not among them, so that they remain free for variables and dictionaries.
enum class Keyword : std::uint8_t {
  None,
  Activate,
  And,
  Application,
  Count,
  Div,
  Else,
  End,
  Equals,
  Every,
  Exit,
  False,
  First,
  Get,
  If,
  Ignoring,
  Is,
  It,
  Item,
  Its,
  Last,
  Launch,
  Mod,
  Not,
  Of,
  Or,
  Repeat,
  Return,
  Set,
  Tell,
  The,
  Then,
  To,
  True,
  With,
  Without,
};

struct Token {
  TokenKind kind = TokenKind::EndOfSource;
  Keyword keyword = Keyword::None;
  /// The line it stands on, from 1.
  std::int32_t line = 1;
  /// Words only: foldedHash of the text.
  std::uint32_t hash = 0;
  /// As written, in the source; a text without its quotes but with its escapes.
  std::string_view text;
};

/// Splits a source into tokens that end with EndOfLine and EndOfSource and point into it. Throws Error where
/// a character fits nowhere, a text has no end or the source is not UTF-8.
std::vector<Token> tokenize(std::string_view source);

}  // namespace tarnscript
