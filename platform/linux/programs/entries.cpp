#include "platform/linux/programs/entries.h"

#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <system_error>
#include <utility>

#include "platform/base/subprocess.h"
#include "platform/linux/programs/entry_records.h"
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

/// What the reader says; nothing when it failed.
std::optional<std::string> askReader(const char* option) {
  const std::string path = readerPath();
  base::Subprocess reader{.path = path, .arguments = {path}};
  if (option != nullptr) reader.arguments.emplace_back(option);
  auto said = base::runToEnd(std::move(reader), kLongestReport, base::Deadline(kReadingLimit));
  if (!said || said->status != 0) return std::nullopt;
  return std::move(said->output);
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
  if (const auto text = askReader(nullptr)) sEntries = parse(*text);
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
  const std::string id = askReader(kDefaultMusicPlayerOption).value_or("");
  const Entry* const entry = entryByID(id);
  return entry != nullptr && entry->role == Role::Jukebox ? entry->id : "";
}

}  // namespace linux::programs
