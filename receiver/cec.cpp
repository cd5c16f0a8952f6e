#include "receiver/cec.h"

#include <fcntl.h>
#include <linux/cec.h>
#include <sys/ioctl.h>

#include <cerrno>
#include <optional>

#include "platform/base/file_descriptor.h"
#include "receiver/udev.h"

namespace receiver {
namespace {

/// Whether the adapter has an address on the bus, without which no television talks to it; nothing where it
/// may not be asked.
std::optional<bool> hasAddress(const std::string& path) {
  const base::FileDescriptor file(open(path.c_str(), O_RDONLY | O_CLOEXEC));
  cec_log_addrs addresses{};
  if (!file || ioctl(file.get(), CEC_ADAP_G_LOG_ADDRS, &addresses) != 0) return std::nullopt;
  return addresses.num_log_addrs > 0;
}

}  // namespace

std::vector<std::string> adaptersWithoutKeys() {
  std::vector<std::string> lines;
  forEachDevice("cec", "cec*", [&lines](sd_device* device) {
    const std::string path = nodeOf(device);
    const auto address = path.empty() ? true : hasAddress(path);
    if (address == true) return;
    lines.push_back(path + ", an HDMI-CEC adapter, " +
                    (address ? "passes no keys on" : "may pass no keys on") + ": cec-ctl --device=" + path +
                    " --playback switches that on" + (address ? "" : " (it takes root or the group video)"));
  });
  return lines;
}

}  // namespace receiver
