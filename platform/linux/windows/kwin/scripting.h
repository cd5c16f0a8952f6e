// Scripts that KWin runs, by org.kde.kwin.Scripting on the session bus.
#pragma once

#include <string>
#include <string_view>

#include "platform/base/file_descriptor.h"

namespace linux::windows::kwin {

inline constexpr char kKWinName[] = "org.kde.KWin";

/// A script that KWin has been told to run, and is told to let go of when this goes.
class RunningScript {
 public:
  RunningScript() = default;
  /// Nobody waits for it to be read. Nothing is run while KWin has another one of the name.
  RunningScript(std::string name, std::string_view text);
  RunningScript(RunningScript&& other) noexcept = default;
  RunningScript& operator=(RunningScript&& other) noexcept;
  ~RunningScript();

 private:
  std::string name_;
  /// Which KWin reads, whenever it comes to it.
  base::FileDescriptor file_;
};

/// Has KWin let go of a script that a program which came to no good end may have left there.
void unloadLeftover(const std::string& name);

/// A name for scripts that no other program's have.
std::string scriptName(std::string_view purpose);

}  // namespace linux::windows::kwin
