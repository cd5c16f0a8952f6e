#include "platform/linux/programs/entries.h"

#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <system_error>
#include <utility>

#include "platform/base/subprocess.h"
#include "platform/text/case.h"

namespace linux::programs {

namespace {

/// Reading some hundred entries from a cold disk takes a second; a reader that takes longer is given up.
constexpr std::chrono::seconds kReadingLimit{3};
/// No desktop has that much to say about players.
constexpr std::size_t kLongestReport = 1 << 20;

/// Where the reader is: beside kvd in a build tree, in its own directory when installed.
std::string readerPath() {
  std::error_code error;
  const std::filesystem::path directory =
      std::filesystem::read_symlink("/proc/self/exe", error).parent_path();
  const std::filesystem::path beside = directory / "kvd-entries";
  if (access(beside.c_str(), X_OK) == 0) return beside;
  return directory / KVD_LIBEXEC_FROM_BIN / "kvd-entries";
}

/// What the reader says, up to where it failed or was given up; nothing where it could not be started.
std::string askReader(const char* option) {
  const std::string path = readerPath();
  base::Subprocess reader{.path = path, .arguments = {path}};
  if (option != nullptr) reader.arguments.emplace_back(option);
  auto said = base::runToEnd(std::move(reader), kLongestReport, base::Deadline(kReadingLimit));
  return said ? std::move(said->output) : std::string();
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

/// A line that was cut short is no record.
std::vector<Entry> parse(const std::string& report) {
  std::vector<Entry> parsed;
  for (const std::string& line : split(report, '\n')) {
    if (auto entry = fromRecord(line)) parsed.push_back(*std::move(entry));
  }
  return parsed;
}

/// The directories of shared data, most important first (XDG Base Directory Specification 0.8).
std::vector<std::string> dataDirectories() {
  const auto variable = [](const char* name, const std::string& otherwise) {
    const char* const value = std::getenv(name);
    return value != nullptr && *value != '\0' ? std::string(value) : otherwise;
  };
  std::vector<std::string> directories =
      split(variable("XDG_DATA_DIRS", "/usr/local/share/:/usr/share/"), ':');
  directories.insert(directories.begin(), variable("XDG_DATA_HOME", variable("HOME", "") + "/.local/share"));
  return directories;
}

/// When the application directories were last changed, one after the other.
std::vector<std::int64_t> directoryTimes() {
  std::vector<std::int64_t> times;
  for (const std::string& directory : dataDirectories()) {
    struct stat found {};
    const bool there = stat((directory + "/applications").c_str(), &found) == 0;
    times.push_back(there ? found.st_mtim.tv_sec * 1'000'000'000LL + found.st_mtim.tv_nsec : 0);
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
  // A reader that failed is not tried again before something has changed: it may have taken its full time.
  sTimes = std::move(times);
  sEntries = parse(askReader(nullptr));
  return sEntries;
}

const Entry* entryByID(std::string_view id) {
  if (id.empty()) return nullptr;
  return find([&](const Entry& entry) { return text::equalIgnoringCase(entry.id, id); });
}

const Entry* entryByWindowClass(std::string_view windowClass) {
  if (windowClass.empty()) return nullptr;
  const Entry* const found =
      find([&](const Entry& entry) { return text::equalIgnoringCase(entry.windowClass, windowClass); });
  return found != nullptr ? found : entryByID(windowClass);
}

std::string defaultMusicPlayer() {
  const std::string id = askReader(kDefaultMusicPlayerOption);
  const Entry* const entry = entryByID(id);
  return entry != nullptr && entry->role == Role::Jukebox ? entry->id : "";
}

}  // namespace linux::programs
