#include "platform/linux/windows/wlr/sway.h"

#include <unistd.h>

#include <algorithm>
#include <array>
#include <cstdlib>
#include <cstring>
#include <nlohmann/json.hpp>
#include <utility>

#include "platform/base/deadline.h"
#include "platform/base/file_descriptor.h"
#include "platform/linux/windows/wlr/ipc.h"

namespace linux::windows::wlr {

namespace {

using Json = nlohmann::json;

/// What precedes the text of a question and of an answer.
struct Header {
  std::array<char, 6> magic{'i', '3', '-', 'i', 'p', 'c'};
  std::array<std::uint32_t, 2> lengthAndType{};
};
constexpr std::size_t kHeaderSize = 14;
constexpr std::uint32_t kGetTree = 4;

/// Each compositor's own socket goes by its process; a variable may name another one, or one of long ago.
base::FileDescriptor connectToCompositor(pid_t compositor) {
  const char* const directory = std::getenv("XDG_RUNTIME_DIR");
  const char* const named = std::getenv("SWAYSOCK");
  const std::string own = std::string(directory != nullptr ? directory : "") + "/sway-ipc." +
                          std::to_string(getuid()) + "." + std::to_string(compositor) + ".sock";
  for (const std::string& path : {own, std::string(named != nullptr ? named : "")}) {
    base::FileDescriptor socket = connectTo(path, compositor);
    if (socket) return socket;
  }
  return base::FileDescriptor();
}

std::string askFor(std::uint32_t type, const base::FileDescriptor& socket, const base::Deadline& deadline) {
  Header header;
  header.lengthAndType = {0, type};
  std::array<char, kHeaderSize> question{};
  std::memcpy(question.data(), header.magic.data(), header.magic.size());
  std::memcpy(question.data() + header.magic.size(), header.lengthAndType.data(),
              sizeof header.lengthAndType);
  if (!ask(socket, {question.data(), question.size()})) return {};
  std::string answer;
  if (!readUpTo(kHeaderSize, socket, deadline, answer)) return {};
  std::uint32_t length = 0;
  std::memcpy(&length, answer.data() + header.magic.size(), sizeof length);
  if (length > kLongestAnswer || !readUpTo(kHeaderSize + length, socket, deadline, answer)) return {};
  return answer.substr(kHeaderSize);
}

Container containerOf(const Json& node, const std::string& output) {
  Container made{valueIn<std::int64_t>(node, "id"),    static_cast<pid_t>(valueIn<std::int64_t>(node, "pid")),
                 valueIn<std::string>(node, "app_id"), valueIn<std::string>(node, "name"),
                 valueIn<bool>(node, "visible"),       output};
  const auto properties = node.find("window_properties");
  if (properties != node.end() && made.applicationID.empty()) {
    made.applicationID = valueIn<std::string>(*properties, "class");
  }
  return made;
}

}  // namespace

std::vector<Container> askSway(pid_t compositor, const base::Deadline& deadline) {
  const base::FileDescriptor socket = connectToCompositor(compositor);
  if (!socket) return {};
  return swayWindowsIn(askFor(kGetTree, socket, deadline));
}

std::vector<Container> swayWindowsIn(std::string_view tree) {
  std::vector<Container> found;
  const Json root = Json::parse(tree, nullptr, false);
  struct Pending {
    const Json* node;
    std::string output;
  };
  std::vector<Pending> pending{{&root, {}}};
  while (!pending.empty()) {
    const auto [node, above] = std::move(pending.back());
    pending.pop_back();
    if (!node->is_object()) continue;
    const std::string output =
        valueIn<std::string>(*node, "type") == "output" ? valueIn<std::string>(*node, "name") : above;
    // Of all that is in the tree only windows have a process.
    if (node->contains("pid")) found.push_back(containerOf(*node, output));
    for (const char* const children : {"nodes", "floating_nodes"}) {
      const auto list = node->find(children);
      if (list == node->end() || !list->is_array()) continue;
      for (const Json& child : *list) pending.push_back({&child, output});
    }
  }
  std::ranges::sort(found, {}, &Container::id);
  return found;
}

}  // namespace linux::windows::wlr
