#include "platform/linux/programs/desktop_entry.h"

#include <algorithm>
#include <memory>
#include <string_view>

#include "platform/linux/programs/table.h"

namespace linux::programs {

namespace {

constexpr const char* kCastKey = "X-Kvd-Application";
/// What stands there instead of an identifier where the program takes the remote itself.
constexpr const char* kOwnRemote = "own-remote";

struct StringReleaser {
  void operator()(char* text) const { g_free(text); }
};

std::string textOf(const char* text) { return text != nullptr ? text : ""; }

std::string textOf(GDesktopAppInfo* info, const char* key) {
  const std::unique_ptr<char, StringReleaser> text(g_desktop_app_info_get_string(info, key));
  return textOf(text.get());
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

/// Empty for a program that needs a terminal: it cannot be started without one.
std::vector<std::string> commandOf(GDesktopAppInfo* info) {
  std::vector<std::string> words;
  gchar** arguments = nullptr;
  const bool startable = g_desktop_app_info_get_boolean(info, "Terminal") == FALSE;
  const char* const line = startable ? g_app_info_get_commandline(G_APP_INFO(info)) : nullptr;
  if (line == nullptr || g_shell_parse_argv(line, nullptr, &arguments, nullptr) == FALSE) return words;
  for (gchar** argument = arguments; *argument != nullptr; ++argument) words.emplace_back(*argument);
  g_strfreev(arguments);
  return withoutFieldCodes(words);
}

}  // namespace

std::optional<Entry> entryIn(GDesktopAppInfo* info, const std::string& id) {
  const Program* const known = programByEntry(id);
  Entry entry;
  entry.id = id;
  entry.cast = g_desktop_app_info_has_key(info, kCastKey) != FALSE;
  if (entry.cast) {
    entry.role = roleOf(textOf(info, kCastKey));
    entry.takesRemote = textOf(info, kCastKey) == kOwnRemote;
  } else if (known != nullptr) {
    entry.role = known->role;
    entry.takesRemote = known->takesRemote;
  } else {
    entry.role = roleByCategories(textOf(g_desktop_app_info_get_categories(info)));
  }
  if (entry.role == Role::None && !entry.cast && !entry.takesRemote) return std::nullopt;
  entry.windowClass = textOf(g_desktop_app_info_get_startup_wm_class(info));
  entry.busActivatable = g_desktop_app_info_get_boolean(info, "DBusActivatable") != FALSE;
  entry.directory = textOf(info, "Path");
  entry.command = commandOf(info);
  return entry;
}

}  // namespace linux::programs
