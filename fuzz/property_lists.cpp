// Property lists and the bundles that hold them: what was read, written out and read again, is the same.

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <string>
#include <string_view>

#include "fuzz/directory.h"
#include "fuzz/fuzz.h"
#include "platform/base/values.h"

namespace {

namespace files = std::filesystem;
using base::Owned;
using fuzz::require;

std::string escaped(std::string_view text) {
  std::string written;
  for (const char c : text) written += c == '&' ? "&amp;" : c == '<' ? "&lt;" : std::string(1, c);
  return written;
}

std::string inBase64(std::string_view bytes) {
  constexpr char kDigits[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
  std::string written;
  for (std::size_t at = 0; at < bytes.size(); at += 3) {
    std::uint32_t group = 0;
    for (std::size_t i = at; i < at + 3; ++i) {
      group = group << 8 | (i < bytes.size() ? static_cast<std::uint8_t>(bytes[i]) : 0);
    }
    for (std::size_t i = 0; i < 4; ++i) {
      written += at + i <= bytes.size() ? kDigits[group >> (18 - 6 * i) & 63] : '=';
    }
  }
  return written;
}

std::string numberText(const base::Number::Content& number) {
  if (const bool* const truth = std::get_if<bool>(&number)) return *truth ? "<true/>" : "<false/>";
  const auto* const real = std::get_if<double>(&number);
  if (real == nullptr) return "<integer>" + std::to_string(std::get<std::int64_t>(number)) + "</integer>";
  char text[64];
  std::snprintf(text, sizeof text, "<real>%.17g</real>", *real);
  return text;
}

std::string valueText(HostObject* value) {
  if (const auto* const string = base::as<base::String>(value))
    return "<string>" + escaped(string->text) + "</string>";
  if (const auto* const data = base::as<base::Data>(value))
    return "<data>" + inBase64(data->bytes) + "</data>";
  if (const auto* const number = base::as<base::Number>(value)) return numberText(number->value);
  std::string text;
  if (const auto* const list = base::as<base::List>(value)) {
    for (HostObject* const item : list->items) text += valueText(item);
    return "<array>" + text + "</array>";
  }
  for (const auto& [key, item] : base::as<base::Dictionary>(value)->entries) {
    text += "<key>" + escaped(key) + "</key>" + valueText(item);
  }
  return "<dict>" + text + "</dict>";
}

Owned<HostObject> parse(HostObject* data) {
  HostStringRef problem;
  Owned<HostObject> list(HostParsePropertyList(HostDataRef(data), &problem).object);
  require((list == nullptr) == static_cast<bool>(problem), "a list or a problem, never both");
  HostRelease(problem);
  return list;
}

/// The bytes of a resource in a bundle; nothing where it does not have it.
Owned<HostObject> resource(const Owned<HostObject>& bundle, std::string_view name) {
  const Owned<HostObject> wanted(new base::String(std::string(name)));
  const Owned<HostObject> location(
      HostCopyBundleResourceLocation(HostBundleRef(bundle.get()), HostStringRef(wanted.get()), {}, {})
          .object);
  return Owned<HostObject>(HostReadResourceData(HostLocationRef(location.get())).object);
}

void check(const files::path& place, std::string_view text) {
  std::ofstream(place / "Resources/list.plist", std::ios::binary) << text;
  const Owned<HostObject> bundle(HostCreateBundle(place.c_str()).object);
  const Owned<HostObject> data = resource(bundle, "list.plist");
  require(data != nullptr && base::as<base::Data>(data.get())->bytes == text, "a resource is read whole");
  const std::string_view name = text.substr(0, text.find('\n'));
  require(name.find('/') == name.npos || resource(bundle, name) == nullptr, "a name leads nowhere else");

  const Owned<HostObject> list = parse(data.get());
  if (list == nullptr) return;
  const std::string written = valueText(list.get());
  const Owned<HostObject> document(new base::Data("<plist>" + written + "</plist>"));
  const Owned<HostObject> again = parse(document.get());
  require(again != nullptr && valueText(again.get()) == written, "a list that is written out reads the same");
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const fuzz::Directory directory;
  static const bool hasResources = files::create_directory(directory.path / "Resources");
  require(hasResources, "there is a bundle");
  check(directory.path, fuzz::textOf(data, size));
  for (const std::size_t count : base::aliveByKind()) require(count == 0, "nothing is left alive");
  return 0;
}
