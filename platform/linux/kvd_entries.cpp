// The program kvd-entries: tells kvd what the desktop entries say.
//
// Without an argument it writes a record for each installed program that plays a role, takes the remote
// itself or was cast for either, each as soon as it is known; with --default-music-player the identifier of
// the person's default for music files.

#include <gio/gdesktopappinfo.h>

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <memory>
#include <set>
#include <string>
#include <string_view>
#include <system_error>

#include "platform/linux/programs/desktop_entry.h"
#include "platform/linux/programs/entry.h"

namespace {

namespace files = std::filesystem;
namespace programs = linux::programs;

constexpr const char* kMusicTypes[] = {"audio/mpeg", "audio/flac", "audio/x-vorbis+ogg"};
constexpr std::string_view kSuffix = ".desktop";

/// In bytes: the largest real ones hold a name in every language and have a third of that. What is larger is
/// no entry.
constexpr std::uintmax_t kLargestFile = std::uintmax_t{256} * 1024;

struct ObjectReleaser {
  void operator()(gpointer object) const { g_object_unref(object); }
};
using OwnedInfo = std::unique_ptr<GDesktopAppInfo, ObjectReleaser>;

std::string textOf(const char* text) { return text != nullptr ? text : ""; }

std::string withoutSuffix(std::string id) {
  if (id.ends_with(kSuffix)) id.resize(id.size() - kSuffix.size());
  return id;
}

void report(GDesktopAppInfo* info, const std::string& id) {
  const auto entry = programs::entryIn(info, id);
  if (!entry) return;
  std::fputs(programs::toRecord(*entry).c_str(), stdout);
  // Should this program be given up, kvd has what was found so far.
  std::fflush(stdout);
}

/// Whether the file can be read to its end, and in no time: a pipe or a device might never end.
bool isReadable(const files::path& path) {
  std::error_code error;
  if (!files::is_regular_file(path, error)) return false;
  const std::uintmax_t size = files::file_size(path, error);
  return !error && size <= kLargestFile;
}

/// "player.desktop" in a directory "kde" is called "kde-player".
std::string idOf(const files::path& path, const files::path& directory) {
  std::string id = path.lexically_relative(directory).string();
  std::replace(id.begin(), id.end(), '/', '-');
  return withoutSuffix(std::move(id));
}

/// Of several entries with one identifier the first that is found counts, though it may say that there is
/// none (Hidden).
void reportDirectory(const files::path& directory, std::set<std::string>& known) {
  std::error_code error;
  for (files::recursive_directory_iterator found(directory, error), end; !error && found != end;
       found.increment(error)) {
    const files::path& path = found->path();
    if (path.extension() != kSuffix || !isReadable(path)) continue;
    const std::string id = idOf(path, directory);
    if (!known.insert(id).second) continue;
    const OwnedInfo info(g_desktop_app_info_new_from_filename(path.c_str()));
    if (info != nullptr && g_desktop_app_info_get_is_hidden(info.get()) == FALSE) report(info.get(), id);
  }
}

void reportEntries() {
  std::set<std::string> known;
  reportDirectory(files::path(g_get_user_data_dir()) / "applications", known);
  for (const gchar* const* directory = g_get_system_data_dirs(); *directory != nullptr; ++directory) {
    reportDirectory(files::path(*directory) / "applications", known);
  }
}

void reportDefaultMusicPlayer() {
  for (const char* type : kMusicTypes) {
    GAppInfo* const info = g_app_info_get_default_for_type(type, FALSE);
    if (info == nullptr) continue;
    std::fputs(withoutSuffix(textOf(g_app_info_get_id(info))).c_str(), stdout);
    return;
  }
}

}  // namespace

int main(int argc, char** argv) {
  const std::string_view option = argc == 2 ? argv[1] : "";
  if (argc > 2 || (argc == 2 && option != programs::kDefaultMusicPlayerOption)) {
    std::fprintf(stderr, "Usage: kvd-entries [%s]\n", programs::kDefaultMusicPlayerOption);
    return 2;
  }
  if (option.empty()) {
    reportEntries();
  } else {
    reportDefaultMusicPlayer();
  }
  return std::fflush(stdout) == 0 && std::ferror(stdout) == 0 ? 0 : 1;
}
