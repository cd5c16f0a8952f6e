#include "platform/tarnscript/lexer.h"

#include <algorithm>
#include <array>
#include <utility>

#include "platform/tarnscript/tarnscript.h"
#include "platform/text/case.h"
#include "platform/text/utf8.h"

namespace tarnscript {

namespace {

constexpr auto kKeywords = std::to_array<std::pair<std::string_view, Keyword>>({
    {"activate", Keyword::Activate},
    {"and", Keyword::And},
    {"application", Keyword::Application},
    {"count", Keyword::Count},
    {"div", Keyword::Div},
    {"else", Keyword::Else},
    {"end", Keyword::End},
    {"equals", Keyword::Equals},
    {"every", Keyword::Every},
    {"exit", Keyword::Exit},
    {"false", Keyword::False},
    {"first", Keyword::First},
    {"front", Keyword::First},
    {"get", Keyword::Get},
    {"if", Keyword::If},
    {"ignoring", Keyword::Ignoring},
    {"is", Keyword::Is},
    {"it", Keyword::It},
    {"item", Keyword::Item},
    {"its", Keyword::Its},
    {"last", Keyword::Last},
    {"launch", Keyword::Launch},
    {"mod", Keyword::Mod},
    {"not", Keyword::Not},
    {"of", Keyword::Of},
    {"or", Keyword::Or},
    {"repeat", Keyword::Repeat},
    {"return", Keyword::Return},
    {"set", Keyword::Set},
    {"tell", Keyword::Tell},
    {"the", Keyword::The},
    {"then", Keyword::Then},
    {"to", Keyword::To},
    {"true", Keyword::True},
    {"with", Keyword::With},
    {"without", Keyword::Without},
});

/// Positions in kKeywords plus one, by hash and with linear probing; 0 is a free slot.
constexpr auto kKeywordSlots = [] {
  std::array<std::uint8_t, 128> slots{};
  for (std::size_t i = 0; i < kKeywords.size(); ++i) {
    std::size_t slot = text::foldedHash(kKeywords[i].first) % slots.size();
    while (slots[slot] != 0) slot = (slot + 1) % slots.size();
    slots[slot] = static_cast<std::uint8_t>(i + 1);
  }
  return slots;
}();

Keyword findKeyword(std::string_view word, std::uint32_t hash) {
  for (std::size_t slot = hash % kKeywordSlots.size(); kKeywordSlots[slot] != 0;
       slot = (slot + 1) % kKeywordSlots.size()) {
    const auto& [text, keyword] = kKeywords[kKeywordSlots[slot] - 1U];
    if (text::equalIgnoringCase(text, word)) return keyword;
  }
  return Keyword::None;
}

/// The symbols, each before those that begin it.
constexpr auto kSymbols = std::to_array<std::pair<std::string_view, TokenKind>>({
    {"(", TokenKind::OpenParenthesis},
    {")", TokenKind::CloseParenthesis},
    {"{", TokenKind::OpenBrace},
    {"}", TokenKind::CloseBrace},
    {",", TokenKind::Comma},
    {"'s", TokenKind::Possessive},
    {"\u2019s", TokenKind::Possessive},
    {"+", TokenKind::Plus},
    {"-", TokenKind::Minus},
    {"*", TokenKind::Times},
    {"/=", TokenKind::NotEqual},
    {"/", TokenKind::Divide},
    {"&", TokenKind::Concatenate},
    {"=", TokenKind::Equal},
    {"\u2260", TokenKind::NotEqual},
    {"<=", TokenKind::LessOrEqual},
    {"\u2264", TokenKind::LessOrEqual},
    {"<", TokenKind::Less},
    {">=", TokenKind::GreaterOrEqual},
    {"\u2265", TokenKind::GreaterOrEqual},
    {">", TokenKind::Greater},
});

const auto* findSymbol(std::string_view text) {
  return std::find_if(kSymbols.begin(), kSymbols.end(),
                      [text](const auto& entry) { return text.starts_with(entry.first); });
}

constexpr bool isDigit(char c) { return c >= '0' && c <= '9'; }
constexpr bool isLetter(char c) { return (text::foldCase(c) >= 'a' && text::foldCase(c) <= 'z') || c == '_'; }
constexpr bool isBeyondAscii(char c) { return static_cast<unsigned char>(c) >= 0x80; }

class Lexer {
 public:
  explicit Lexer(std::string_view source) : rest_(source) { tokens_.reserve(source.size() / 4 + 2); }

  std::vector<Token> run() {
    while (!rest_.empty()) next();
    add(TokenKind::EndOfLine, 0);
    add(TokenKind::EndOfSource, 0);
    return std::move(tokens_);
  }

 private:
  void next() {
    const char c = rest_.front();
    if (c == ' ' || c == '\t') {
      rest_.remove_prefix(1);
    } else if (c == '\n' || c == '\r') {
      endLine();
    } else if (c == '#' || rest_.starts_with("--")) {
      rest_.remove_prefix(std::min(rest_.find_first_of("\r\n"), rest_.size()));
    } else if (c == '"') {
      text();
    } else if (isDigit(c)) {
      number();
    } else if (isLetter(c)) {
      word();
    } else if (!symbol()) {
      if (!isBeyondAscii(c)) fail("unexpected character");
      word();
    }
  }

  void endLine() {
    const bool startsLine = tokens_.empty() || tokens_.back().kind == TokenKind::EndOfLine;
    const std::size_t length = rest_.starts_with("\r\n") ? 2 : 1;
    if (startsLine) {
      rest_.remove_prefix(length);
    } else {
      add(TokenKind::EndOfLine, length);
    }
    ++line_;
  }

  void text() {
    std::size_t length = 1;
    while (length < rest_.size() && rest_[length] != '"') {
      const auto c = static_cast<unsigned char>(rest_[length]);
      if (c < ' ' && c != '\t') fail("a text must end on its line and hold no control characters");
      length += c == '\\' ? 2 : 1;
    }
    if (length >= rest_.size()) fail("a text has no closing quote");
    rest_.remove_prefix(1);
    add(TokenKind::Text, length - 1);
    rest_.remove_prefix(1);
  }

  void number() {
    const auto digits = [this](std::size_t at) {
      while (at < rest_.size() && isDigit(rest_[at])) ++at;
      return at;
    };
    const auto digitAt = [this](std::size_t at) { return at < rest_.size() && isDigit(rest_[at]); };
    TokenKind kind = TokenKind::Integer;
    std::size_t length = digits(0);
    if (length < rest_.size() && rest_[length] == '.' && digitAt(length + 1)) {
      kind = TokenKind::Real;
      length = digits(length + 1);
    }
    if (length < rest_.size() && text::foldCase(rest_[length]) == 'e') {
      const bool isSigned =
          length + 1 < rest_.size() && (rest_[length + 1] == '+' || rest_[length + 1] == '-');
      const std::size_t exponent = length + (isSigned ? 2 : 1);
      if (digitAt(exponent)) {
        kind = TokenKind::Real;
        length = digits(exponent);
      }
    }
    add(kind, length);
  }

  bool symbol() {
    const auto* const found = findSymbol(rest_);
    if (found == kSymbols.end()) return false;
    add(found->second, found->first.size());
    return true;
  }

  void word() {
    std::size_t length = 1;
    while (length < rest_.size()) {
      const char c = rest_[length];
      if (!isLetter(c) && !isDigit(c) && !isBeyondAscii(c)) break;
      // The symbols beyond ASCII end a word just as the others do.
      if (isBeyondAscii(c) && findSymbol(rest_.substr(length)) != kSymbols.end()) break;
      ++length;
    }
    const std::string_view text = rest_.substr(0, length);
    const std::uint32_t hash = text::foldedHash(text);
    const Keyword keyword = findKeyword(text, hash);
    if (keyword == Keyword::The) {
      rest_.remove_prefix(length);
      return;
    }
    add(TokenKind::Word, length);
    tokens_.back().keyword = keyword;
    tokens_.back().hash = hash;
  }

  void add(TokenKind kind, std::size_t length) {
    tokens_.push_back(Token{kind, Keyword::None, line_, 0, rest_.substr(0, length)});
    rest_.remove_prefix(length);
  }

  [[noreturn]] void fail(const char* message) const { throw Error{message, line_}; }

  std::string_view rest_;
  std::int32_t line_ = 1;
  std::vector<Token> tokens_;
};

}  // namespace

std::vector<Token> tokenize(std::string_view source) {
  if (const std::size_t bad = text::findInvalidUTF8(source); bad != std::string_view::npos) {
    const auto before = source.substr(0, bad);
    throw Error{"the source is not valid UTF-8",
                1 + static_cast<int>(std::count(before.begin(), before.end(), '\n'))};
  }
  return Lexer(source).run();
}

}  // namespace tarnscript
