#include "platform/tarnscript/vocabulary.h"

#include <algorithm>

#include "platform/text/case.h"

namespace tarnscript {

std::size_t matchWords(std::span<const Token> tokens, std::string_view words) {
  std::size_t length = 0;
  while (!words.empty()) {
    const std::size_t end = std::min(words.find(' '), words.size());
    // The last token is never a word, so this cannot run off the end.
    if (tokens[length].kind != TokenKind::Word) return 0;
    if (!text::equalIgnoringCase(tokens[length].text, words.substr(0, end))) return 0;
    ++length;
    words.remove_prefix(std::min(end + 1, words.size()));
  }
  return length;
}

Vocabulary::Vocabulary(Application& application)
    : application_(&application), dictionary_(&application.dictionary()) {
  const Dictionary& d = *dictionary_;
  entries_.reserve(d.properties.size() + 2 * d.classes.size() + d.constants.size() + d.commands.size());
  for (std::size_t i = 0; i < d.properties.size(); ++i) add(d.properties[i].words, Kind::Property, i);
  for (std::size_t i = 0; i < d.constants.size(); ++i) add(d.constants[i].words, Kind::Constant, i);
  for (std::size_t i = 0; i < d.commands.size(); ++i) add(d.commands[i].words, Kind::Command, i);
  for (std::size_t i = 0; i < d.classes.size(); ++i) {
    add(d.classes[i].words, Kind::Class, i);
    add(d.classes[i].plural, Kind::Plural, i);
  }
}

void Vocabulary::add(std::string_view words, Kind kind, std::size_t index) {
  auto& bucket = buckets_[text::foldedHash(words.substr(0, words.find(' '))) % buckets_.size()];
  entries_.push_back(Entry{words, kind, static_cast<std::uint32_t>(index), bucket});
  bucket = static_cast<std::uint32_t>(entries_.size());
}

namespace {

template <typename Term>
bool keepLonger(Found<Term>& found, const Term& term, std::size_t length) {
  if (length <= found.length) return false;
  found = {&term, length};
  return true;
}

}  // namespace

void Vocabulary::match(std::span<const Token> tokens, Matches& matches) const {
  const Dictionary& d = *dictionary_;
  for (std::uint32_t at = buckets_[tokens.front().hash % buckets_.size()]; at != 0;) {
    const Entry& entry = entries_[at - 1];
    at = entry.next;
    const std::size_t length = matchWords(tokens, entry.words);
    switch (entry.kind) {
      case Kind::Property:
        keepLonger(matches.property, d.properties[entry.index], length);
        break;
      case Kind::Constant:
        keepLonger(matches.constant, d.constants[entry.index], length);
        break;
      case Kind::Command:
        if (keepLonger(matches.command, d.commands[entry.index], length)) matches.commandVocabulary = this;
        break;
      case Kind::Class:
      case Kind::Plural:
        if (keepLonger(matches.cls, d.classes[entry.index], length)) {
          matches.plural = entry.kind == Kind::Plural;
        }
        break;
    }
  }
}

}  // namespace tarnscript
