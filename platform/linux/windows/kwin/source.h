// The two ways in which KWin tells of windows.
#pragma once

#include <cstdint>
#include <vector>

#include "platform/linux/windows/window.h"

namespace linux::windows::kwin {

struct Source {
  /// Counts changes: windows that came or went or changed places, another active one, another name.
  unsigned (*changes)();
  /// As they are now, topmost first; whose ids have numbers and no back end.
  std::vector<Window> (*windows)();
  /// Asks for the window to come to the front.
  void (*activate)(std::uint64_t window);
};

}  // namespace linux::windows::kwin
