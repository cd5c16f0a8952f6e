#include "receiver/pass_through/uinput.h"

#include <fcntl.h>
#include <linux/uinput.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <string_view>
#include <system_error>

#include "receiver/pass_through/protocol.h"

namespace receiver::pass_through {
namespace {

constexpr std::string_view kName = "kvd pass-through";

[[noreturn]] void fail(const char* what) { throw std::system_error(errno, std::generic_category(), what); }

template <typename Argument>
void set(const base::FileDescriptor& device, unsigned long request, Argument argument) {
  if (ioctl(device.get(), request, argument) != 0) fail("uinput");
}

}  // namespace

base::FileDescriptor makeDevice(const char* path) {
  base::FileDescriptor device(open(path, O_WRONLY | O_CLOEXEC));
  if (!device) fail(path);
  // No EV_REP: desktops repeat held keys themselves, and logind would take each repeat of the power key for
  // another press.
  set(device, UI_SET_EVBIT, EV_KEY);
  for (const int key : kKeys) set(device, UI_SET_KEYBIT, key);
  uinput_setup setup{};
  setup.id.bustype = BUS_VIRTUAL;
  std::ranges::copy(kName, setup.name);
  set(device, UI_DEV_SETUP, &setup);
  set(device, UI_DEV_CREATE, 0);
  return device;
}

void press(const base::FileDescriptor& device, std::uint16_t key, std::uint16_t value) {
  std::array<input_event, 2> events{};
  events[0].type = EV_KEY;
  events[0].code = key;
  events[0].value = value;
  events[1].type = EV_SYN;
  events[1].code = SYN_REPORT;
  if (write(device.get(), events.data(), sizeof events) != sizeof events) fail("uinput");
}

}  // namespace receiver::pass_through
