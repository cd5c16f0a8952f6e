// A reader of XML property lists, top-down: the document, a value, the containers, the scalars.
#include <algorithm>
#include <charconv>
#include <map>

#include "platform/base/values.h"
#include "platform/property_list/base64.h"
#include "platform/property_list/xml_reader.h"

namespace property_list {
namespace {

using base::Data;
using base::Dictionary;
using base::List;
using base::Number;
using base::Owned;
using base::String;

/// An application's property list has some kilobytes; reading stays short whatever is handed in.
constexpr std::size_t kLargestPropertyList = 4U << 20;
/// Containers within containers; reading and releasing them recurse once a level.
constexpr int kDeepestNesting = 64;

using Tag = XmlReader::Tag;

class Reader {
 public:
  explicit Reader(std::string_view document) : xml_(document) {}

  Owned<HostObject> readDocument();

 private:
  Owned<HostObject> readValue(const Tag& tag, int depth);
  Owned<HostObject> readDictionary(const Tag& tag, int depth);
  Owned<HostObject> readList(const Tag& tag, int depth);
  Owned<HostObject> readScalar(const Tag& tag);
  template <typename Value>
  Value numberIn(std::string_view text) const;

  XmlReader xml_;
};

Owned<HostObject> Reader::readDocument() {
  xml_.begin();
  const Tag root = xml_.openTag(true);
  if (root.name != "plist" || root.closed) xml_.fail("a property list begins with <plist>");
  xml_.skipBetweenTags();
  auto value = readValue(xml_.openTag(), 1);
  xml_.skipBetweenTags();
  xml_.closeTag("plist");
  xml_.end();
  return value;
}

Owned<HostObject> Reader::readValue(const Tag& tag, int depth) {
  if (depth > kDeepestNesting) xml_.fail("the property list is nested too deeply");
  if (tag.name == "dict") return readDictionary(tag, depth);
  if (tag.name == "array") return readList(tag, depth);
  return readScalar(tag);
}

Owned<HostObject> Reader::readDictionary(const Tag& tag, int depth) {
  std::map<std::string, Owned<HostObject>> values;
  for (xml_.skipBetweenTags(); !tag.closed && !xml_.atClosingTag(); xml_.skipBetweenTags()) {
    const Tag key = xml_.openTag();
    if (key.name != "key") xml_.fail("a dictionary holds keys and values");
    std::string name = xml_.readText(key);
    xml_.skipBetweenTags();
    values.insert_or_assign(std::move(name), readValue(xml_.openTag(), depth + 1));
  }
  if (!tag.closed) xml_.closeTag(tag.name);
  Dictionary::Entries entries;
  for (auto& [name, value] : values) entries.emplace_back(name, value.release());
  return Owned<HostObject>(new Dictionary(std::move(entries)));
}

Owned<HostObject> Reader::readList(const Tag& tag, int depth) {
  std::vector<Owned<HostObject>> values;
  for (xml_.skipBetweenTags(); !tag.closed && !xml_.atClosingTag(); xml_.skipBetweenTags()) {
    values.push_back(readValue(xml_.openTag(), depth + 1));
  }
  if (!tag.closed) xml_.closeTag(tag.name);
  std::vector<HostObject*> items(values.size());
  std::ranges::transform(values, items.begin(), [](auto& value) { return value.release(); });
  return Owned<HostObject>(new List(std::move(items)));
}

/// A date as the format writes it: 2001-02-03T04:05:06Z.
bool isDate(std::string_view text) {
  static constexpr std::string_view pattern = "0000-00-00T00:00:00Z";
  return std::ranges::equal(
      text, pattern, [](char c, char wanted) { return wanted == '0' ? c >= '0' && c <= '9' : c == wanted; });
}

template <typename Value>
Value Reader::numberIn(std::string_view text) const {
  Value value{};
  if (text.starts_with('+') && !text.starts_with("+-")) text.remove_prefix(1);
  const char* end = text.data() + text.size();
  const auto [stop, error] = std::from_chars(text.data(), end, value);
  if (error != std::errc() || stop != end) xml_.fail("a number is malformed or out of range");
  return value;
}

Owned<HostObject> Reader::readScalar(const Tag& tag) {
  std::string text = xml_.readText(tag);
  if (tag.name == "string") return Owned<HostObject>(new String(std::move(text)));
  if (tag.name == "integer") return Owned<HostObject>(new Number(numberIn<std::int64_t>(text)));
  if (tag.name == "real") return Owned<HostObject>(new Number(numberIn<double>(text)));
  if ((tag.name == "true" || tag.name == "false") && text.empty()) {
    return Owned<HostObject>(new Number(tag.name == "true"));
  }
  if (tag.name == "date" && isDate(text)) return Owned<HostObject>(new String(std::move(text)));
  if (tag.name == "data") {
    if (auto bytes = decodeBase64(text)) return Owned<HostObject>(new Data(std::move(*bytes)));
  }
  xml_.fail(std::string(tag.name) + " is no value, or its content is malformed");
}

}  // namespace
}  // namespace property_list

HostDictionaryRef HostParsePropertyList(HostDataRef data, HostStringRef* errorText) {
  if (errorText != nullptr) *errorText = nullptr;
  std::string problem = "there are no data, or too many";
  const auto* source = base::as<base::Data>(data);
  if (source != nullptr && source->bytes.size() <= property_list::kLargestPropertyList) {
    try {
      auto value = property_list::Reader(source->bytes).readDocument();
      if (base::as<base::Dictionary>(value.get()) != nullptr) return HostDictionaryRef(value.release());
      problem = "the property list is no dictionary";
    } catch (const property_list::Malformed& malformed) {
      problem = malformed.message;
    }
  }
  if (errorText != nullptr) *errorText = HostStringRef(new base::String(problem));
  return nullptr;
}
