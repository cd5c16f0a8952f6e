// What sway and Hyprland answer on their sockets. An input for Hyprland has its windows, a line "---" and its
// monitors.

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <string>
#include <string_view>
#include <vector>

#include "fuzz/answers.h"
#include "fuzz/fuzz.h"
#include "platform/linux/windows/wlr/hyprland.h"
#include "platform/linux/windows/wlr/sway.h"

namespace {

namespace wlr = linux::windows::wlr;
using Windows = std::vector<wlr::Container>;
using fuzz::require;

constexpr std::string_view kBoundary = "\n---\n";

/// What a question gets that is answered so.
Windows ask(Windows (*question)(pid_t, const base::Deadline&), std::string_view answer) {
  fuzz::setAnswer(answer);
  return question(fuzz::kProcess, base::Deadline(std::chrono::seconds(1)));
}

/// An answer of sway with the header that it has.
std::string withHeader(std::string_view text) {
  std::string answer = "i3-ipc........";
  const auto length = static_cast<std::uint32_t>(text.size());
  std::memcpy(answer.data() + 6, &length, sizeof length);
  return answer.append(text);
}

bool areSame(const Windows& one, const Windows& other) {
  return std::ranges::equal(one, other, [](const auto& a, const auto& b) {
    return a.id == b.id && a.process == b.process && a.applicationID == b.applicationID &&
           a.title == b.title && a.isVisible == b.isVisible && a.output == b.output;
  });
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  setenv("XDG_RUNTIME_DIR", "/run", 1);
  setenv("HYPRLAND_INSTANCE_SIGNATURE", "fuzz", 1);
  const std::string_view text = fuzz::textOf(data, size);
  ask(wlr::askSway, text);
  const Windows tree = wlr::swayWindowsIn(text);
  require(areSame(ask(wlr::askSway, withHeader(text)), tree), "an answer over the socket is read whole");
  require(std::ranges::is_sorted(tree, {}, &wlr::Container::id), "windows come in the order of their ids");

  require(areSame(ask(wlr::askHyprland, text), wlr::hyprlandWindowsIn(text, text)), "as does Hyprland's");
  const std::size_t boundary = std::min(text.find(kBoundary), text.size());
  const std::string_view monitors = text.substr(std::min(boundary + kBoundary.size(), text.size()));
  for (const wlr::Container& window : wlr::hyprlandWindowsIn(text.substr(0, boundary), monitors)) {
    require(window.id != 0, "a window has an address");
    require(!window.isVisible || !monitors.empty(), "a window that is shown is on a monitor");
  }
  return 0;
}
