// A bundle is a directory; its resources lie in Contents/Resources, in Resources or in the directory itself,
// whichever is there first.
#include <filesystem>
#include <fstream>

#include "platform/base/values.h"

namespace fs = std::filesystem;

namespace property_list {
namespace {

/// A resource is read whole; larger files are no property lists of an application.
constexpr std::uintmax_t kLargestResource = 16U << 20;

struct Bundle final : HostObject {
  static constexpr base::Kind kKind = base::Kind::Bundle;
  explicit Bundle(fs::path place) : HostObject(kKind), directory(std::move(place)) {}
  const fs::path directory;
};

struct Location final : HostObject {
  static constexpr base::Kind kKind = base::Kind::Location;
  explicit Location(fs::path place) : HostObject(kKind), path(std::move(place)) {}
  const fs::path path;
};

fs::path resourceDirectory(const fs::path& bundle) {
  std::error_code error;
  for (const char* inside : {"Contents/Resources", "Resources"}) {
    if (fs::is_directory(bundle / inside, error)) return bundle / inside;
  }
  return bundle;
}

/// True when the text names something inside its directory and nothing outside.
bool isPlainName(const std::string& text) {
  return text.find('/') == std::string::npos && text.find("..") == std::string::npos;
}

}  // namespace
}  // namespace property_list

HostBundleRef HostCreateBundle(const char* directory) {
  std::error_code error;
  if (directory == nullptr || !fs::is_directory(directory, error)) return nullptr;
  return HostBundleRef(new property_list::Bundle(directory));
}

HostLocationRef HostCopyBundleResourceLocation(HostBundleRef bundle, HostStringRef name, HostStringRef type,
                                               HostStringRef subdirectory) {
  const auto* place = base::as<property_list::Bundle>(bundle);
  std::string file = base::textOf(name);
  const std::string& extension = base::textOf(type);
  const std::string& below = base::textOf(subdirectory);
  if (place == nullptr || file.empty()) return nullptr;
  if (!property_list::isPlainName(file) || !property_list::isPlainName(extension) ||
      !property_list::isPlainName(below))
    return nullptr;
  if (!extension.empty()) file += "." + extension;
  fs::path path = property_list::resourceDirectory(place->directory) / below / file;
  std::error_code error;
  if (!fs::is_regular_file(path, error)) return nullptr;
  return HostLocationRef(new property_list::Location(std::move(path)));
}

HostDataRef HostReadResourceData(HostLocationRef location) {
  const auto* place = base::as<property_list::Location>(location);
  if (place == nullptr) return nullptr;
  std::error_code error;
  const auto size = fs::file_size(place->path, error);
  if (error || size > property_list::kLargestResource || !fs::is_regular_file(place->path, error))
    return nullptr;
  std::string bytes(size, '\0');
  std::ifstream file(place->path, std::ios::binary);
  if (!file.read(bytes.data(), static_cast<std::streamsize>(size))) return nullptr;
  return HostDataRef(new base::Data(std::move(bytes)));
}
