#include <algorithm>
#include <cstdint>
#include <limits>
#include <unordered_map>

#include "platform/base/values.h"
#include "platform/text/utf8.h"

using base::as;
using base::String;

HostStringRef HostAsString(HostObject* object) { return HostStringRef(as<String>(object)); }

HostStringRef HostGetConstantString(const char* text) {
  // Never destroyed: constant strings are used until the last exit handler has run.
  static auto& strings = *new std::unordered_map<std::string_view, String*>;
  if (text == nullptr) return nullptr;
  if (const auto known = strings.find(text); known != strings.end()) return HostStringRef(known->second);
  auto* made = new String(text);
  made->immortal = true;
  strings.emplace(made->text, made);
  return HostStringRef(made);
}

HostStringRef HostGetBundleIdentifierKey() { return HostGetConstantString("bundle identifier"); }
HostStringRef HostGetBundleVersionKey() { return HostGetConstantString("bundle version"); }
HostStringRef HostGetSerialNumberKey() { return HostGetConstantString("serial number"); }

HostStringRef HostCreateStringFromUTF8(const char* bytes) {
  if (bytes == nullptr || !text::isUTF8(bytes)) return nullptr;
  return HostStringRef(base::makeTemporary(new String(bytes)));
}

bool HostStringsAreEqual(HostStringRef a, HostStringRef b) {
  const auto* left = as<String>(a);
  const auto* right = as<String>(b);
  return left != nullptr && right != nullptr && left->text == right->text;
}

HostListRef HostCreateListBySeparatingString(HostStringRef string, HostStringRef separator) {
  if (as<String>(string) == nullptr || as<String>(separator) == nullptr) return nullptr;
  const std::string& text = base::textOf(string);
  const std::string& mark = base::textOf(separator);
  std::vector<HostObject*> pieces;
  std::size_t begin = 0;
  if (!mark.empty()) {
    for (std::size_t end = 0; (end = text.find(mark, begin)) != std::string::npos;
         begin = end + mark.size()) {
      pieces.push_back(new String(text.substr(begin, end - begin)));
    }
  }
  pieces.push_back(new String(text.substr(begin)));
  return HostListRef(new base::List(std::move(pieces)));
}

std::int32_t HostStringIntegerValue(HostStringRef string) {
  const std::string& text = base::textOf(string);
  auto at = std::min(text.find_first_not_of(" \t\n\v\f\r"), text.size());
  const bool negative = at < text.size() && text[at] == '-';
  if (at < text.size() && (text[at] == '-' || text[at] == '+')) ++at;
  using Limits = std::numeric_limits<std::int32_t>;
  std::int64_t value = 0;
  for (; at < text.size() && text[at] >= '0' && text[at] <= '9'; ++at) {
    // Held one past the bound: more digits cannot overflow it, and both bounds can still be reached.
    value = std::min(value * 10 + (text[at] - '0'), std::int64_t{Limits::max()} + 1);
  }
  value = negative ? -value : value;
  return static_cast<std::int32_t>(std::clamp<std::int64_t>(value, Limits::min(), Limits::max()));
}
