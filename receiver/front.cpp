#include "receiver/front.h"

#include <sys/epoll.h>

#include <chrono>
#include <system_error>
#include <utility>

#include "platform/base/run_loop.h"
#include "platform/linux/programs/own_remote.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/windows/every_backend.h"
#include "platform/linux/windows/windows.h"

namespace receiver {

namespace {

using namespace std::chrono_literals;
namespace programs = linux::programs;
namespace windows = linux::windows;

/// Where nobody tells who is in front: how often keys may lead to a look at all processes.
constexpr Time kLookInterval = 2s;

/// Takes in all that the window systems have sent.
void takeInWindows() {
  // What comes while a question is answered waits in the libraries, and wakes nobody: only what is quiet
  // twice is quiet.
  constexpr int kMostRounds = 16;
  for (int round = 0, quiet = 0; round < kMostRounds && quiet < 2; ++round) {
    base::runPending();
    quiet = windows::takeIn() ? 0 : quiet + 1;
  }
}

void leaveWindows() {
  windows::finish();
  linux::system::closeBus();
}

}  // namespace

std::string takerNow() {
  windows::init(windows::everyBackend(), windows::Use::Looking);
  takeInWindows();
  std::string taker = programs::takerOfRemote();
  leaveWindows();
  return taker;
}

Front::Front(sd_event* loop, std::function<void()> changed) : changed_(std::move(changed)) {
  sd_event_source* source = nullptr;
  const auto wake = [](sd_event_source*, int, std::uint32_t, void* self) {
    static_cast<Front*>(self)->takeIn();
    return 0;
  };
  const int result = sd_event_add_io(loop, &source, base::runLoopDescriptor(), EPOLLIN, wake, this);
  if (result < 0) throw std::system_error(-result, std::generic_category());
  source_.reset(source);
  // Whose a key is must be known before it is taken.
  sd_event_source_set_priority(source, SD_EVENT_PRIORITY_IMPORTANT);
}

Front::~Front() { follow(false); }

void Front::follow(bool on) {
  if (on == following_) return;
  following_ = on;
  if (on) {
    windows::init(windows::everyBackend(), windows::Use::Looking);
    takeIn();
  } else {
    leaveWindows();
    taker_.clear();
  }
}

void Front::refresh() {
  if (following_ && !windows::knowsFront() && (!looked_ || now() - *looked_ >= kLookInterval)) takeIn();
}

void Front::takeIn() {
  if (!following_) return;
  takeInWindows();
  looked_ = now();
  std::string taker = programs::takerOfRemote();
  if (taker == taker_) return;
  taker_ = std::move(taker);
  changed_();
}

}  // namespace receiver
