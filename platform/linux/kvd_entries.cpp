// The program kvd-entries: tells kvd what the desktop entries say.
//
// Without an argument it writes a record for each installed program that plays a role or was cast for one;
// with
// --default-music-player the identifier of the person's default for music files.

#include <gio/gdesktopappinfo.h>

#include <algorithm>
#include <cstdio>
#include <memory>
#include <string>
#include <string_view>

#include "platform/linux/programs/entry_records.h"
#include "platform/linux/programs/table.h"

namespace {

namespace programs = linux::programs;
using programs::Role;

constexpr const char* kCastKey = "X-Kvd-Application";
constexpr const char* kMusicTypes[] = {"audio/mpeg", "audio/flac", "audio/x-vorbis+ogg"};

struct StringReleaser {
  void operator()(char* text) const { g_free(text); }
};
using OwnedText = std::unique_ptr<char, StringReleaser>;

std::string textOf(const char* text) { return text != nullptr ? text : ""; }

std::string withoutSuffix(std::string id) {
  constexpr std::string_view kSuffix = ".desktop";
  if (id.ends_with(kSuffix)) id.resize(id.size() - kSuffix.size());
  return id;
}

bool has(std::string_view categories, std::string_view category) {
  for (std::size_t at = 0; at <= categories.size();) {
    const std::size_t end = std::min(categories.find(';', at), categories.size());
    if (categories.substr(at, end - at) == category) return true;
    at = end + 1;
  }
  return false;
}

/// The role that the categories suggest (Desktop Menu Specification 1.1).
Role roleByCategories(std::string_view categories) {
  if (has(categories, "WebBrowser")) return Role::None;
  if (has(categories, "Presentation")) return Role::Presentation;
  if (has(categories, "Photography")) {
    return has(categories, "Viewer") ? Role::PhotoLibrary : Role::ProfessionalPhotos;
  }
  if (!has(categories, "Player")) return Role::None;
  if (has(categories, "Video")) return Role::ModernMovies;
  return has(categories, "Audio") || has(categories, "Music") ? Role::Jukebox : Role::None;
}

void describe(GDesktopAppInfo* info, std::string& report) {
  const std::string id = withoutSuffix(textOf(g_app_info_get_id(G_APP_INFO(info))));
  const bool cast = g_desktop_app_info_has_key(info, kCastKey) != FALSE;
  const OwnedText castAs(cast ? g_desktop_app_info_get_string(info, kCastKey) : nullptr);
  const programs::Program* const known = programs::programByEntry(id);
  Role role =
      known != nullptr ? known->role : roleByCategories(textOf(g_desktop_app_info_get_categories(info)));
  if (cast) role = programs::roleOf(textOf(castAs.get()));
  if (role == Role::None && !cast) return;

  const OwnedText directory(g_desktop_app_info_get_string(info, "Path"));
  const bool activatable = g_desktop_app_info_get_boolean(info, "DBusActivatable") != FALSE;
  const auto put = [&](const std::string& field) { report.append(field).push_back(programs::kFieldEnd); };
  put(id);
  put(textOf(g_desktop_app_info_get_startup_wm_class(info)));
  put(std::to_string(static_cast<int>(role)));
  put(cast ? "1" : "0");
  put(activatable ? "1" : "0");
  put(textOf(directory.get()));
  gchar** arguments = nullptr;
  // A program for a terminal cannot be started without one.
  const bool startable = g_desktop_app_info_get_boolean(info, "Terminal") == FALSE;
  const char* const line = startable ? g_app_info_get_commandline(G_APP_INFO(info)) : nullptr;
  if (line != nullptr && g_shell_parse_argv(line, nullptr, &arguments, nullptr) != FALSE) {
    for (gchar** argument = arguments; *argument != nullptr; ++argument) {
      const std::string_view text = *argument;
      // %f, %U, %i and the like stand for files and decoration that are not given here.
      if (text.size() == 2 && text[0] == '%' && text[1] != '%') continue;
      put(text == "%%" ? "%" : std::string(text));
    }
    g_strfreev(arguments);
  }
  report.push_back(programs::kRecordEnd);
}

std::string reportEntries() {
  std::string report;
  GList* const all = g_app_info_get_all();
  for (GList* item = all; item != nullptr; item = item->next) {
    if (G_IS_DESKTOP_APP_INFO(item->data)) describe(G_DESKTOP_APP_INFO(item->data), report);
  }
  return report;
}

std::string reportDefaultMusicPlayer() {
  for (const char* type : kMusicTypes) {
    GAppInfo* const info = g_app_info_get_default_for_type(type, FALSE);
    if (info != nullptr) return withoutSuffix(textOf(g_app_info_get_id(info)));
  }
  return {};
}

}  // namespace

int main(int argc, char** argv) {
  const std::string_view option = argc == 2 ? argv[1] : "";
  if (argc > 2 || (argc == 2 && option != programs::kDefaultMusicPlayerOption)) {
    std::fprintf(stderr, "Usage: kvd-entries [%s]\n", programs::kDefaultMusicPlayerOption);
    return 2;
  }
  const std::string report = option.empty() ? reportEntries() : reportDefaultMusicPlayer();
  const bool written = std::fwrite(report.data(), 1, report.size(), stdout) == report.size();
  return written && std::fflush(stdout) == 0 ? 0 : 1;
}
