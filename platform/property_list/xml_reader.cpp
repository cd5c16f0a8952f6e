#include "platform/property_list/xml_reader.h"

#include <algorithm>
#include <charconv>
#include <cstdint>
#include <utility>

#include "platform/text/utf8.h"

namespace property_list {
namespace {

constexpr std::string_view kBlanks = " \t\r\n";

bool isTextCharacter(char c) {
  return static_cast<unsigned char>(c) >= 0x20 || kBlanks.find(c) != std::string_view::npos;
}

/// True for the characters that a reference may stand for.
bool isXmlCharacter(std::uint32_t c) {
  if (c < 0x20) return isTextCharacter(static_cast<char>(c));
  const bool surrogate = c >= 0xD800 && c <= 0xDFFF;
  return !surrogate && c <= 0x10FFFF;
}

}  // namespace

void XmlReader::begin() {
  if (!std::ranges::all_of(rest_, isTextCharacter) || !text::isUTF8(rest_)) fail("this is not text in UTF-8");
  skip("\xEF\xBB\xBF");
  if (skip("<?xml ")) takeUntil("?>");
  skipBetweenTags();
  if (skip("<!DOCTYPE ")) skipDocumentType();
  skipBetweenTags();
}

void XmlReader::end() {
  skipBetweenTags();
  if (!rest_.empty()) fail("there is something after the document");
}

XmlReader::Tag XmlReader::openTag(bool withAttributes) {
  if (!skip("<")) fail("a tag is missing");
  const std::string_view name = takeName();
  for (skipBlanks(); withAttributes && !rest_.starts_with('>'); skipBlanks()) {
    takeName();
    if (!skip("=\"")) fail("an attribute is malformed");
    takeUntil("\"");
  }
  const bool closed = skip("/");
  if (!skip(">")) fail("a tag is malformed");
  return {name, closed};
}

void XmlReader::closeTag(std::string_view name) {
  const bool named = skip("</") && skip(name);
  skipBlanks();
  if (!named || !skip(">")) fail("</" + std::string(name) + "> is missing");
}

std::string XmlReader::readText(const Tag& tag) {
  std::string text;
  while (!tag.closed && !atClosingTag()) {
    const std::size_t length = std::min(rest_.find_first_of("<&"), rest_.size());
    text += rest_.substr(0, length);
    rest_.remove_prefix(length);
    if (skip("&")) {
      text::appendUTF8(text, readReference());
    } else if (skip("<![CDATA[")) {
      text += takeUntil("]]>");
    } else if (skip("<!--")) {
      skipComment();
    } else if (!atClosingTag()) {
      fail("<" + std::string(tag.name) + "> is not closed");
    }
  }
  if (!tag.closed) closeTag(tag.name);
  return text;
}

/// What stands between & and ; as a character.
char32_t XmlReader::readReference() {
  static constexpr std::pair<std::string_view, char32_t> named[] = {
      {"amp", '&'}, {"lt", '<'}, {"gt", '>'}, {"quot", '"'}, {"apos", '\''}};
  std::string_view name = takeUntil(";");
  for (const auto& [known, character] : named) {
    if (name == known) return character;
  }
  if (!name.starts_with('#')) fail("an entity is unknown");
  name.remove_prefix(1);
  const bool hexadecimal = name.starts_with('x');
  if (hexadecimal) name.remove_prefix(1);
  std::uint32_t character = 0;
  const char* end = name.data() + name.size();
  const auto [stop, error] = std::from_chars(name.data(), end, character, hexadecimal ? 16 : 10);
  if (error != std::errc() || stop != end || !isXmlCharacter(character)) {
    fail("a character reference is malformed");
  }
  return character;
}

void XmlReader::skipBlanks() {
  rest_.remove_prefix(std::min(rest_.find_first_not_of(kBlanks), rest_.size()));
}

void XmlReader::skipBetweenTags() {
  for (skipBlanks(); skip("<!--"); skipBlanks()) skipComment();
}

void XmlReader::skipComment() {
  takeUntil("--");
  if (!skip(">")) fail("a comment holds two hyphens");
}

/// The rest of a document type without declarations of its own: those could make entities that grow.
void XmlReader::skipDocumentType() {
  const std::string_view type = takeUntil(">");
  if (type.find_first_of("[<") != std::string_view::npos)
    fail("declarations in the document type are not read");
}

bool XmlReader::skip(std::string_view expected) {
  if (!rest_.starts_with(expected)) return false;
  rest_.remove_prefix(expected.size());
  return true;
}

std::string_view XmlReader::takeName() {
  const auto end = std::ranges::find_if(rest_, [](char c) { return c < 'a' || c > 'z'; });
  const std::string_view name = rest_.substr(0, static_cast<std::size_t>(end - rest_.begin()));
  if (name.empty()) fail("a name is missing");
  rest_.remove_prefix(name.size());
  return name;
}

/// What stands before the mark; the mark is taken too.
std::string_view XmlReader::takeUntil(std::string_view mark) {
  const std::size_t length = rest_.find(mark);
  if (length == std::string_view::npos) fail("the property list ends too early");
  const std::string_view taken = rest_.substr(0, length);
  rest_.remove_prefix(length + mark.size());
  return taken;
}

void XmlReader::fail(std::string_view message) const {
  const auto read = document_.substr(0, document_.size() - rest_.size());
  const auto line = 1 + std::ranges::count(read, '\n');
  throw Malformed{"line " + std::to_string(line) + ": " + std::string(message)};
}

}  // namespace property_list
