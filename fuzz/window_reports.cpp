// What KWin's script and GNOME Shell's extension tell of windows over the session bus.

#include <string>
#include <vector>

#include "fuzz/bus.h"
#include "fuzz/fuzz.h"
#include "platform/base/run_loop.h"
#include "platform/linux/windows/gnome/shell.h"
#include "platform/linux/windows/kwin/reports.h"

namespace {

namespace windows = linux::windows;
using fuzz::require;

constexpr char kKWin[] = "\nGetNameOwner s :1.7\nList aa{sv}a(iiii) 0 0\n";

void check(const std::vector<windows::Window>& told) {
  for (const windows::Window& window : told) require(window.id.number != 0, "a window has a number");
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  // Whoever failed is tried again in another turn.
  base::runPending();
  const std::string lines = std::string(fuzz::textOf(data, size)) + kKWin;
  fuzz::beginBus(lines);
  if (windows::kwin::openReports()) {
    const auto told = windows::kwin::kReports.windows();
    check(told);
    for (const auto& window : told)
      require(!window.isFullScreen || window.isShown, "what fills a screen is shown");
    if (!told.empty()) windows::kwin::kReports.activate(told.front().id.number);
  }
  windows::kwin::closeReports();
  windows::gnome::takeInShell();
  check(windows::gnome::windowsTold());
  require(windows::gnome::outputsTold().size() <= 32, "not more monitors than anybody has");
  windows::gnome::forgetShell();
  return 0;
}
