#include "receiver/port.h"

#include <sys/inotify.h>

#include <string_view>

#include "messages/kvd_messages.h"
#include "platform/base/service_directory.h"
#include "remote/kvd_client.h"

namespace receiver {
namespace {

using namespace std::chrono_literals;

/// How long a button waits for a daemon that is being started.
constexpr Time kPatience = 2s;

/// As many buttons as a hand can press in that time, by far.
constexpr std::size_t kMostWaiting = 64;

bool isService(const inotify_event& event) {
  return event.len > 0 && std::string_view(event.name) == kKVDServiceName;
}

}  // namespace

Port::Port(sd_event* loop, std::function<void()> changed) : changed_(std::move(changed)) {
  if (const auto directory = base::serviceDirectory(base::Side::Sends)) {
    constexpr std::uint32_t kComes = IN_CREATE | IN_MOVED_TO;
    constexpr std::uint32_t kGoes = IN_DELETE | IN_MOVED_FROM;
    const auto look = [](sd_event_source*, const inotify_event* event, void* self) {
      if (!isService(*event)) return 0;
      auto* const port = static_cast<Port*>(self);
      // The news of one that has come by now follows, and is enough.
      (event->mask & kComes) != 0 ? port->lookAgain() : port->lose();
      return 0;
    };
    sd_event_source* watch = nullptr;
    sd_event_add_inotify(loop, &watch, directory->c_str(), kComes | kGoes, look, this);
    watch_.reset(watch);
  }
  lookUp();
}

void Port::lookUp() {
  lockTold_ = false;
  if (kvd_look_up(&port_) != KVD_SENT) port_ = MACH_PORT_NULL;
}

void Port::lookAgain() {
  const bool wasOpen = isOpen();
  lookUp();
  if (isOpen() != wasOpen) changed_();
  if (!isOpen()) return;
  tellLock();
  sendWaiting();
}

void Port::lose() {
  const bool wasOpen = isOpen();
  port_ = MACH_PORT_NULL;
  if (wasOpen) changed_();
}

void Port::tellLock() {
  if (!isOpen() || !locked_ || lockTold_) return;
  lockTold_ = kvd_setscreenlocked(port_, *locked_ ? 1 : 0) == MACH_MSG_SUCCESS;
}

bool Port::send(const remote::Button& button, std::int32_t value) {
  if (!isOpen()) return false;
  tellLock();
  return kvd_handlehidevent(port_, button.usagePage, button.usage, 0, value) != MACH_SEND_INVALID_DEST;
}

void Port::sendWaiting() {
  while (!waiting_.empty()) {
    const Waiting next = waiting_.front();
    waiting_.pop_front();
    if (now() - next.since <= kPatience) send(*next.button, next.value);
  }
}

void Port::sendButton(const remote::Button& button, std::int32_t value) {
  if (send(button, value)) return;
  // Its socket may be another one by now, of which the news is still on its way.
  lookAgain();
  if (send(button, value)) return;
  waiting_.push_back({&button, value, now()});
  if (waiting_.size() > kMostWaiting) waiting_.pop_front();
}

void Port::setLocked(bool locked) {
  if (locked_ != locked) lockTold_ = false;
  locked_ = locked;
  tellLock();
}

void Port::daemonStarted() {
  // It begins with an unlocked screen.
  lockTold_ = locked_ == false;
  tellLock();
}

}  // namespace receiver
