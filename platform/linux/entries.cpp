#include "platform/linux/entries.h"

#include <fcntl.h>
#include <gio/gdesktopappinfo.h>
#include <poll.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <functional>
#include <memory>
#include <optional>

#include "platform/tarnscript/text.h"

namespace desktop {

namespace {

constexpr const char* kCastKey = "X-Kvd-Application";
constexpr const char* kMusicTypes[] = {"audio/mpeg", "audio/flac", "audio/x-vorbis+ogg"};

/// Reading some hundred entries from a cold disk takes a second; a child that takes longer is given up.
constexpr std::chrono::seconds kReadingLimit{3};
/// No desktop has that much to say about players.
constexpr std::size_t kLongestReport = 1 << 20;

// What the child writes: a record a program, fields ended by kFieldEnd, records by kRecordEnd. Neither byte
// can stand in a desktop entry's value.
constexpr char kFieldEnd = '\x1f';
constexpr char kRecordEnd = '\x1e';

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

// ---- In the child

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
  const Program* const known = programByEntry(id);
  Role role =
      known != nullptr ? known->role : roleByCategories(textOf(g_desktop_app_info_get_categories(info)));
  if (cast) role = roleOf(textOf(castAs.get()));
  if (role == Role::None && !cast) return;

  const OwnedText directory(g_desktop_app_info_get_string(info, "Path"));
  const bool activatable = g_desktop_app_info_get_boolean(info, "DBusActivatable") != FALSE;
  const auto put = [&](const std::string& field) { report.append(field).push_back(kFieldEnd); };
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
  report.push_back(kRecordEnd);
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

[[noreturn]] void report(int output, const std::function<std::string()>& make) {
  const std::string text = make();
  for (std::size_t written = 0; written < text.size();) {
    const ssize_t count = write(output, text.data() + written, text.size() - written);
    if (count < 0 && errno != EINTR) _exit(1);
    if (count > 0) written += static_cast<std::size_t>(count);
  }
  _exit(0);
}

// ---- In the daemon

/// Everything that comes out of the descriptor until it ends; nothing when that takes too long.
std::optional<std::string> readToEnd(int input) {
  using Clock = std::chrono::steady_clock;
  const auto deadline = Clock::now() + kReadingLimit;
  std::string text;
  char buffer[4096];
  while (text.size() < kLongestReport) {
    const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(deadline - Clock::now());
    pollfd ready{input, POLLIN, 0};
    if (left.count() <= 0 || poll(&ready, 1, static_cast<int>(left.count())) == 0) return std::nullopt;
    const ssize_t count = read(input, buffer, sizeof buffer);
    if (count == 0) return text;
    if (count < 0 && errno != EINTR) return std::nullopt;
    if (count > 0) text.append(buffer, static_cast<std::size_t>(count));
  }
  return std::nullopt;
}

/// What `make` says in a child process; nothing when it failed.
std::optional<std::string> inChild(const std::function<std::string()>& make) {
  int ends[2];
  if (pipe2(ends, O_CLOEXEC) != 0) return std::nullopt;
  const pid_t child = fork();
  if (child == 0) report(ends[1], make);
  close(ends[1]);
  std::optional<std::string> text;
  if (child > 0) {
    text = readToEnd(ends[0]);
    if (!text) kill(child, SIGKILL);
    int status = 0;
    while (waitpid(child, &status, 0) < 0 && errno == EINTR) {
    }
    if (!WIFEXITED(status) || WEXITSTATUS(status) != 0) text.reset();
  }
  close(ends[0]);
  return text;
}

std::vector<std::string> split(std::string_view text, char end) {
  std::vector<std::string> parts;
  for (std::size_t at = 0; at < text.size();) {
    const std::size_t next = std::min(text.find(end, at), text.size());
    parts.emplace_back(text.substr(at, next - at));
    at = next + 1;
  }
  return parts;
}

std::vector<Entry> parse(const std::string& text) {
  constexpr std::size_t kFixedFields = 6;
  std::vector<Entry> parsed;
  for (const std::string& record : split(text, kRecordEnd)) {
    const std::vector<std::string> fields = split(record, kFieldEnd);
    if (fields.size() < kFixedFields) continue;
    Entry entry;
    entry.id = fields[0];
    entry.windowClass = fields[1];
    entry.role = static_cast<Role>(std::stoi(fields[2]));
    entry.cast = fields[3] == "1";
    entry.busActivatable = fields[4] == "1";
    entry.directory = fields[5];
    entry.command.assign(fields.begin() + kFixedFields, fields.end());
    parsed.push_back(std::move(entry));
  }
  return parsed;
}

/// When the application directories were last changed, one after the other.
std::vector<std::int64_t> directoryTimes() {
  std::vector<std::int64_t> times;
  const auto add = [&](const char* directory) {
    struct stat found {};
    const std::string applications = std::string(directory) + "/applications";
    const bool there = stat(applications.c_str(), &found) == 0;
    times.push_back(there ? found.st_mtim.tv_sec * 1'000'000'000LL + found.st_mtim.tv_nsec : 0);
  };
  add(g_get_user_data_dir());
  for (const char* const* directory = g_get_system_data_dirs(); *directory != nullptr; ++directory) {
    add(*directory);
  }
  return times;
}

template <typename Test>
const Entry* find(Test test) {
  const auto& all = entries();
  const auto found = std::find_if(all.begin(), all.end(), test);
  return found != all.end() ? &*found : nullptr;
}

}  // namespace

const std::vector<Entry>& entries() {
  static std::vector<Entry> sEntries;
  static std::vector<std::int64_t> sTimes;
  std::vector<std::int64_t> times = directoryTimes();
  if (times == sTimes) return sEntries;
  if (const auto text = inChild(reportEntries)) {
    sEntries = parse(*text);
    sTimes = std::move(times);
  }
  return sEntries;
}

const Entry* entryByID(std::string_view id) {
  if (id.empty()) return nullptr;
  return find([&](const Entry& entry) { return tarnscript::equalIgnoringCase(entry.id, id); });
}

const Entry* entryByWindowClass(std::string_view windowClass) {
  if (windowClass.empty()) return nullptr;
  const Entry* const found =
      find([&](const Entry& entry) { return tarnscript::equalIgnoringCase(entry.windowClass, windowClass); });
  return found != nullptr ? found : entryByID(windowClass);
}

std::string defaultMusicPlayer() {
  const std::string id = inChild(reportDefaultMusicPlayer).value_or("");
  const Entry* const entry = entryByID(id);
  return entry != nullptr && entry->role == Role::Jukebox ? entry->id : "";
}

}  // namespace desktop
