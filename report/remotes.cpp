#include "report/remotes.h"

#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <sstream>
#include <string>
#include <system_error>

#include "platform/base/deadline.h"
#include "platform/base/subprocess.h"

namespace report {

namespace {

/// It waits two seconds for its helper at most.
constexpr std::chrono::seconds kLimit{5};
constexpr std::size_t kLongestList = 1 << 18;

}  // namespace

Object describeRemotes() {
  std::error_code error;
  const std::string path =
      std::filesystem::read_symlink("/proc/self/exe", error).parent_path() / "kvd-receiver";
  if (access(path.c_str(), X_OK) != 0) return nullptr;
  const auto said =
      base::runToEnd({.path = path, .arguments = {path, "--list"}}, kLongestList, base::Deadline(kLimit));
  Object lines = Object::array();
  std::istringstream output(said ? said->output : std::string());
  for (std::string line; std::getline(output, line);) lines.push_back(line);
  if (!said || said->status != 0) lines.push_back("kvd-receiver --list did not come to its end.");
  return lines;
}

}  // namespace report
