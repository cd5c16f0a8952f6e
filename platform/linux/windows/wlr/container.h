// A window as compositors tell of it in languages of their own.
#pragma once

#include <sys/types.h>

#include <cstdint>
#include <string>

namespace linux::windows::wlr {

struct Container {
  /// Never 0.
  std::int64_t id = 0;
  pid_t process = 0;
  std::string applicationID;
  std::string title;
  /// On a workspace that is shown.
  bool isVisible = false;
  /// The name of the output that shows it.
  std::string output;
};

}  // namespace linux::windows::wlr
