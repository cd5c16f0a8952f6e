#include "platform/linux/programs/entry.h"

#include <nlohmann/json.hpp>
#include <utility>

namespace linux::programs {

namespace {

using Json = nlohmann::json;

// The members of a record.
constexpr const char* kID = "id";
constexpr const char* kWindowClass = "windowClass";
constexpr const char* kRole = "role";
constexpr const char* kCast = "cast";
constexpr const char* kTakesRemote = "takesRemote";
constexpr const char* kBusActivatable = "busActivatable";
constexpr const char* kDirectory = "directory";
constexpr const char* kCommand = "command";

std::string textIn(const Json& record, const char* member) {
  const auto found = record.find(member);
  return found != record.end() && found->is_string() ? found->get<std::string>() : std::string();
}

bool truthIn(const Json& record, const char* member) {
  const auto found = record.find(member);
  return found != record.end() && found->is_boolean() && found->get<bool>();
}

/// The word with "%%" as "%"; nothing when it holds a field code.
std::optional<std::string> literal(const std::string& word) {
  std::string text;
  for (std::size_t i = 0; i < word.size(); ++i) {
    if (word[i] == '%' && (++i == word.size() || word[i] != '%')) return std::nullopt;
    text.push_back(word[i]);
  }
  return text;
}

}  // namespace

std::vector<std::string> withoutFieldCodes(const std::vector<std::string>& words) {
  std::vector<std::string> left;
  for (const std::string& word : words) {
    if (auto text = literal(word)) left.push_back(*std::move(text));
  }
  return left;
}

std::string toRecord(const Entry& entry) {
  const Json record{{kID, entry.id},
                    {kWindowClass, entry.windowClass},
                    {kRole, bundleIdentifier(entry.role)},
                    {kCast, entry.cast},
                    {kTakesRemote, entry.takesRemote},
                    {kBusActivatable, entry.busActivatable},
                    {kDirectory, entry.directory},
                    {kCommand, entry.command}};
  return record.dump(-1, ' ', false, Json::error_handler_t::replace) + "\n";
}

std::optional<Entry> fromRecord(std::string_view line) {
  const Json record = Json::parse(line, nullptr, false);
  if (!record.is_object()) return std::nullopt;
  Entry entry{.id = textIn(record, kID),
              .windowClass = textIn(record, kWindowClass),
              .role = roleOf(textIn(record, kRole)),
              .cast = truthIn(record, kCast),
              .takesRemote = truthIn(record, kTakesRemote),
              .busActivatable = truthIn(record, kBusActivatable),
              .directory = textIn(record, kDirectory),
              .command = {}};
  if (entry.id.empty()) return std::nullopt;
  const auto command = record.find(kCommand);
  if (command == record.end() || !command->is_array()) return entry;
  for (const Json& word : *command) {
    if (!word.is_string()) return std::nullopt;
    entry.command.push_back(word.get<std::string>());
  }
  return entry;
}

}  // namespace linux::programs
