#include "receiver/device.h"

#include <fcntl.h>
#include <sys/epoll.h>
#include <sys/ioctl.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <utility>

namespace receiver {
namespace {

using namespace std::chrono_literals;

/// Nobody waits so long for what a button does.
constexpr Time kStale = 2s;

/// A time of an unknown clock is believed to be this near.
constexpr Time kStrange = 10s;

}  // namespace

Device::Device(sd_event* loop, const std::string& path, Listener listener)
    : listener_(std::move(listener)), file_(open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC)) {
  if (!file_) throw std::system_error(errno, std::generic_category());
  libevdev* device = nullptr;
  if (const int result = libevdev_new_from_fd(file_.get(), &device); result < 0) {
    throw std::system_error(-result, std::generic_category());
  }
  device_.reset(device);
  clockKnown_ = libevdev_set_clock_id(device, CLOCK_BOOTTIME) == 0;
  const auto readIt = [](sd_event_source*, int, std::uint32_t, void* self) {
    static_cast<Device*>(self)->read();
    return 0;
  };
  sd_event_source* source = nullptr;
  if (const int result = sd_event_add_io(loop, &source, file_.get(), EPOLLIN, readIt, this); result < 0) {
    throw std::system_error(-result, std::generic_category());
  }
  source_.reset(source);
}

void Device::read() {
  if (!drain(LIBEVDEV_READ_FLAG_NORMAL)) {
    const auto gone = listener_.gone;
    return gone();
  }
  settleGrab();
}

// False when the device cannot be read any more.
bool Device::drain(unsigned flag) {
  for (;;) {
    input_event event{};
    const int status = libevdev_next_event(device_.get(), flag, &event);
    if (status == -EAGAIN) return true;
    if (status == LIBEVDEV_READ_STATUS_SYNC && flag == LIBEVDEV_READ_FLAG_NORMAL) {
      // The kernel's queue ran over. What changed meanwhile follows as events of their own, where it can
      // tell.
      scan_.reset();
      if (!drain(LIBEVDEV_READ_FLAG_SYNC)) listener_.confused();
      continue;
    }
    if (status < 0) return false;
    take(event);
  }
}

void Device::take(const input_event& event) {
  if (event.type == EV_MSC && event.code == MSC_SCAN) {
    scan_ = static_cast<std::uint32_t>(event.value);
    return;
  }
  if (event.type != EV_KEY) return;
  const auto scan = std::exchange(scan_, std::nullopt);
  // The kernel's own repeats: kvd has its own.
  if (event.value > 1) return;
  const Time current = now();
  const Time time = timeOf(event, current);
  const bool stale = clockKnown_ && current - time > kStale;
  listener_.changed({event.code, event.value != 0, scan, time, stale, grabbed_});
}

Time Device::timeOf(const input_event& event, Time now) {
  const Time told =
      std::chrono::seconds(event.input_event_sec) + std::chrono::microseconds(event.input_event_usec);
  if (clockKnown_) return told;
  if (!offset_ || std::chrono::abs(told + *offset_ - now) > kStrange) offset_ = now - told;
  return told + *offset_;
}

bool Device::anyKeyDown() const {
  // What the kernel says, not what has been read of it.
  std::array<std::uint8_t, KEY_CNT / 8> down{};
  if (ioctl(file_.get(), EVIOCGKEY(down.size()), down.data()) < 0) return false;
  return std::ranges::any_of(down, [](std::uint8_t bits) { return bits != 0; });
}

bool Device::settleGrab() {
  if (grabbed_ == wantsGrab_ || anyKeyDown()) return true;
  if (libevdev_grab(device_.get(), wantsGrab_ ? LIBEVDEV_GRAB : LIBEVDEV_UNGRAB) < 0) return false;
  grabbed_ = wantsGrab_;
  return true;
}

bool Device::setGrabbed(bool grabbed) {
  wantsGrab_ = grabbed;
  return settleGrab();
}

}  // namespace receiver
