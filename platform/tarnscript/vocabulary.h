// The words of one application, arranged so that those that can stand at a token are found at once.
#pragma once

#include <algorithm>
#include <array>
#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include "platform/tarnscript/lexer.h"
#include "platform/tarnscript/tarnscript.h"

namespace tarnscript {

class Vocabulary;

/// A term of a dictionary and how many tokens its words take; null and 0 when none is there.
template <typename Term>
struct Found {
  const Term* term = nullptr;
  std::size_t length = 0;
};

/// The longest term of each kind at one token.
struct Matches {
  Found<PropertyTerm> property;
  Found<ClassTerm> cls;
  bool plural = false;
  Found<ConstantTerm> constant;
  Found<CommandTerm> command;
  /// Whose command it is, for its parameters.
  const Vocabulary* commandVocabulary = nullptr;

  std::size_t longest() const {
    return std::max({property.length, cls.length, constant.length, command.length});
  }
};

class Vocabulary {
 public:
  explicit Vocabulary(Application& application);

  Application& application() const { return *application_; }
  const Dictionary& dictionary() const { return *dictionary_; }
  /// Puts in what stands at the first of these tokens and is longer than what is in already.
  void match(std::span<const Token> tokens, Matches& matches) const;

 private:
  enum class Kind : std::uint8_t { Property, Class, Plural, Constant, Command };
  struct Entry {
    std::string_view words;
    Kind kind;
    std::uint32_t index;  // in the dictionary's table of that kind
    std::uint32_t next;   // the next entry of its bucket, plus one
  };

  void add(std::string_view words, Kind kind, std::size_t index);

  Application* application_;
  const Dictionary* dictionary_;
  std::vector<Entry> entries_;
  /// By the hash of the first word: the bucket's first entry, plus one.
  std::array<std::uint32_t, 64> buckets_{};
};

/// How many tokens these words take where they stand at the first of the tokens; 0 when they do not. Words
/// are one blank apart.
std::size_t matchWords(std::span<const Token> tokens, std::string_view words);

}  // namespace tarnscript
