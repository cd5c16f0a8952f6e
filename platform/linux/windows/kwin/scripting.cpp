#include "platform/linux/windows/kwin/scripting.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cerrno>
#include <utility>

#include "platform/linux/system/bus.h"

namespace linux::windows::kwin {

namespace {

system::Method scripting(const char* member) { return {"/Scripting", "org.kde.kwin.Scripting", member}; }

}  // namespace

RunningScript::RunningScript(std::string name, std::string_view text)
    : name_(std::move(name)), file_(memfd_create("script", MFD_CLOEXEC)) {
  if (!base::writeAll(file_, text)) return;
  const std::string path = "/proc/" + std::to_string(getpid()) + "/fd/" + std::to_string(file_.get());
  system::send({kKWinName, 0}, scripting("loadScript"), "ss", path.c_str(), name_.c_str());
  system::send({kKWinName, 0}, scripting("start"), "");
}

RunningScript& RunningScript::operator=(RunningScript&& other) noexcept {
  std::swap(name_, other.name_);
  std::swap(file_, other.file_);
  return *this;
}

RunningScript::~RunningScript() {
  if (file_) system::send({kKWinName, 0}, scripting("unloadScript"), "s", name_.c_str());
}

void unloadLeftover(const std::string& name) {
  system::call({kKWinName, 0}, scripting("unloadScript"), system::kQueryLimit, "s", name.c_str());
}

std::string scriptName(std::string_view purpose) {
  return std::string(program_invocation_short_name).append("-").append(purpose);
}

}  // namespace linux::windows::kwin
