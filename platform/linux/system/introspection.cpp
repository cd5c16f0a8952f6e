#include "platform/linux/system/introspection.h"

#include <algorithm>
#include <string_view>

namespace linux::system {

namespace {

constexpr std::size_t kMostChildren = 64;

}  // namespace

std::vector<std::string> childrenOf(const Callee& callee, const char* path) {
  std::vector<std::string> children;
  const Message answer =
      call(callee, {path, "org.freedesktop.DBus.Introspectable", "Introspect"}, kQueryLimit, "");
  const char* description = nullptr;
  if (answer == nullptr || sd_bus_message_read(answer.get(), "s", &description) <= 0) return children;
  // The root element has a name at most where it begins.
  constexpr std::string_view kChild = "<node name=\"";
  std::string_view rest = description;
  rest.remove_prefix(std::min(rest.find("<node") + 1, rest.size()));
  while (children.size() < kMostChildren) {
    const std::size_t at = rest.find(kChild);
    if (at == std::string_view::npos) break;
    rest.remove_prefix(at + kChild.size());
    children.emplace_back(rest.substr(0, rest.find('"')));
  }
  return children;
}

}  // namespace linux::system
