#include "platform/linux/windows/wlr/sway.h"

#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <nlohmann/json.hpp>
#include <utility>

#include "platform/base/deadline.h"
#include "platform/base/file_descriptor.h"
#include "platform/linux/system/local_socket.h"
#include "platform/linux/system/turn.h"

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

/// Hundreds of windows are less than that.
constexpr std::size_t kLongestAnswer = 1 << 20;

/// Each compositor's own socket goes by its process; a variable may name another one, or one of long ago.
base::FileDescriptor connectToCompositor(pid_t compositor) {
  const char* const directory = std::getenv("XDG_RUNTIME_DIR");
  const char* const named = std::getenv("SWAYSOCK");
  const std::string own = std::string(directory != nullptr ? directory : "") + "/sway-ipc." +
                          std::to_string(getuid()) + "." + std::to_string(compositor) + ".sock";
  for (const std::string& path : {own, std::string(named != nullptr ? named : "")}) {
    base::FileDescriptor socket = system::connectTo(path);
    if (socket && system::listenerOf(socket.get()) == compositor) return socket;
  }
  return base::FileDescriptor();
}

/// Reads until there are so many bytes. False when no more come, and when the time is up.
bool readUpTo(std::size_t size, const base::FileDescriptor& socket, const base::Deadline& deadline,
              std::string& answer) {
  while (answer.size() < size) {
    if (!base::waitFor(socket.get(), POLLIN, deadline)) return false;
    std::array<char, 16384> part{};
    const ssize_t count = recv(socket.get(), part.data(), std::min(part.size(), size - answer.size()), 0);
    if (count == 0 || (count < 0 && errno != EINTR && errno != EAGAIN)) return false;
    if (count > 0) answer.append(part.data(), static_cast<std::size_t>(count));
  }
  return true;
}

std::string ask(const base::FileDescriptor& socket, std::uint32_t type, const base::Deadline& deadline) {
  Header header;
  header.lengthAndType = {0, type};
  std::array<char, kHeaderSize> question{};
  std::memcpy(question.data(), header.magic.data(), header.magic.size());
  std::memcpy(question.data() + header.magic.size(), header.lengthAndType.data(),
              sizeof header.lengthAndType);
  // So few bytes always have room in a socket that is new.
  if (send(socket.get(), question.data(), question.size(), MSG_NOSIGNAL) != ssize_t{kHeaderSize}) return {};
  std::string answer;
  if (!readUpTo(kHeaderSize, socket, deadline, answer)) return {};
  std::uint32_t length = 0;
  std::memcpy(&length, answer.data() + header.magic.size(), sizeof length);
  if (length > kLongestAnswer || !readUpTo(kHeaderSize + length, socket, deadline, answer)) return {};
  return answer.substr(kHeaderSize);
}

template <typename T>
T valueIn(const Json& node, const char* member) {
  const auto found = node.find(member);
  if (found == node.end()) return T();
  const T* const value = found->template get_ptr<const T*>();
  return value != nullptr ? *value : T();
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

std::vector<Container> readContainers(pid_t compositor) {
  if (compositor == 0 || system::timedOutThisTurn(compositor)) return {};
  const base::FileDescriptor socket = connectToCompositor(compositor);
  if (!socket) return {};
  const system::Limit limit = system::patience(system::kQueryLimit);
  const base::Deadline deadline(limit);
  const std::string tree = ask(socket, kGetTree, deadline);
  if (tree.empty() && deadline.hasPassed()) {
    system::noteWaitInVain(limit);
    system::noteTimeout(compositor);
  }
  return containersIn(tree);
}

std::vector<Container> containersIn(std::string_view tree) {
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
