#include "receiver/receiver.h"

#include <algorithm>
#include <csignal>
#include <list>
#include <memory>
#include <optional>
#include <string_view>
#include <system_error>
#include <vector>

#include "receiver/bus.h"
#include "receiver/clock.h"
#include "receiver/device.h"
#include "receiver/devices.h"
#include "receiver/front.h"
#include "receiver/handles.h"
#include "receiver/holds.h"
#include "receiver/lock.h"
#include "receiver/monitor.h"
#include "receiver/pass_through.h"
#include "receiver/port.h"
#include "receiver/session.h"

namespace receiver {
namespace {

using namespace std::chrono_literals;

/// How long remotes stay grabbed when nobody listens any more: a daemon that is started anew is back by then.
constexpr Time kGrace = 2s;

/// A remote that is read.
struct Remote {
  int number = 0;
  Node node;
  std::unique_ptr<Device> device;
};

class Receiver {
 public:
  explicit Receiver(const Arguments& arguments);
  ~Receiver() { holds_.releaseAll(); }
  Receiver(const Receiver&) = delete;
  Receiver& operator=(const Receiver&) = delete;

  int run();

 private:
  Source makeTimer(sd_event_time_handler_t handle);
  void endOnSignals();

  void setActive(bool active);
  void setLocked(bool locked);
  void refresh();
  void open(const Node& node);
  void close(int number);
  void setGrab(Remote& remote);
  void setGrabs();
  void onListener();
  void onTaker();

  void take(const Remote& remote, const Change& change);
  void say(const remote::Button& button, std::int32_t value);
  void armBounce();
  int takeNotification(sd_bus_message* signal);

  const Arguments& arguments_;
  Monitor monitor_;
  Loop loop_ = makeLoop();
  Bus systemBus_;
  Bus sessionBus_;
  Port port_;
  PassThrough passThrough_;
  Holds holds_;
  std::list<Remote> remotes_;
  int lastNumber_ = 0;
  bool active_ = false;
  bool listened_;
  Source bounce_;
  Source grace_;
  Slot notifications_;
  Front front_;
  Lock lock_;
  DeviceMonitor devices_;
  std::optional<Session> session_;
};

Receiver::Receiver(const Arguments& arguments)
    : arguments_(arguments),
      monitor_(arguments.action == Action::Monitor),
      systemBus_(joinBus(loop_.get(), sd_bus_open_system)),
      sessionBus_(joinBus(loop_.get(), sd_bus_open_user)),
      port_(loop_.get(), [this] { onListener(); }),
      passThrough_(arguments.passThrough),
      holds_([this](const remote::Button& button, std::int32_t value) { say(button, value); }),
      listened_(port_.isOpen()),
      front_(loop_.get(), [this] { onTaker(); }),
      lock_(sessionBus_.get(), [this](bool locked) { setLocked(locked); }),
      devices_(loop_.get(), [this] { refresh(); }) {
  endOnSignals();
  bounce_ = makeTimer([](sd_event_source*, std::uint64_t, void* self) {
    auto* const receiver = static_cast<Receiver*>(self);
    receiver->holds_.advance(now());
    receiver->armBounce();
    return 0;
  });
  // What a remote has sent by then comes first.
  sd_event_source_set_priority(bounce_.get(), SD_EVENT_PRIORITY_IDLE);
  grace_ = makeTimer([](sd_event_source*, std::uint64_t, void* self) {
    auto* const receiver = static_cast<Receiver*>(self);
    receiver->listened_ = receiver->port_.isOpen();
    receiver->setGrabs();
    return 0;
  });
  if (sessionBus_ != nullptr) {
    notifications_ = match(sessionBus_.get(), "interface='com.tarn.kvd.Notifications',member='Posted'",
                           handler<Receiver, &Receiver::takeNotification>, this);
  }
  session_.emplace(systemBus_.get(),
                   Session::Listener{[this](bool active) { setActive(active); },
                                     [this](bool locked) { lock_.setSessionLocked(locked); },
                                     [this] { holds_.releaseAll(); }});
}

Source Receiver::makeTimer(sd_event_time_handler_t handle) {
  constexpr std::uint64_t kAccuracy = 1000;
  sd_event_source* timer = nullptr;
  const int result = sd_event_add_time(loop_.get(), &timer, CLOCK_BOOTTIME, 0, kAccuracy, handle, this);
  if (result < 0) throw std::system_error(-result, std::generic_category());
  sd_event_source_set_enabled(timer, SD_EVENT_OFF);
  return Source(timer);
}

void setTimer(const Source& timer, Time due) {
  sd_event_source_set_time(timer.get(), static_cast<std::uint64_t>(std::max(due, Time(0)).count()));
  sd_event_source_set_enabled(timer.get(), SD_EVENT_ONESHOT);
}

void Receiver::endOnSignals() {
  for (const int signal : {SIGTERM, SIGINT, SIGHUP, SIGPIPE}) {
    sigset_t set;
    sigemptyset(&set);
    sigaddset(&set, signal);
    sigprocmask(SIG_BLOCK, &set, nullptr);
    sd_event_add_signal(loop_.get(), nullptr, signal, nullptr, nullptr);
  }
}

int Receiver::run() { return sd_event_loop(loop_.get()); }

void Receiver::setActive(bool active) {
  port_.setLocked(lock_.locked());
  if (active == active_) return;
  active_ = active;
  monitor_.session(active);
  refresh();
  if (!active) passThrough_.close();
}

void Receiver::setLocked(bool locked) {
  monitor_.locked(locked);
  port_.setLocked(locked);
}

// Opens the remotes that there are, and closes those that are none any more.
void Receiver::refresh() {
  std::vector<Node> nodes;
  if (active_) nodes = findDevices(arguments_.devices);
  std::erase_if(nodes, [](const Node& node) { return !isRemote(node.verdict); });
  const auto nodeOf = [&nodes](const Remote& remote) {
    return std::ranges::find(nodes, remote.node.path, &Node::path);
  };
  std::vector<int> leaving;
  for (Remote& remote : remotes_) {
    const auto node = nodeOf(remote);
    if (node == nodes.end()) {
      leaving.push_back(remote.number);
    } else {
      remote.node = *node;
      nodes.erase(node);
    }
  }
  for (const int number : leaving) close(number);
  for (const Node& node : nodes) open(node);
  front_.follow(!remotes_.empty());
}

void Receiver::open(const Node& node) {
  const int number = ++lastNumber_;
  Remote& remote = remotes_.emplace_back(Remote{number, node, nullptr});
  try {
    remote.device = std::make_unique<Device>(
        loop_.get(), node.path,
        Device::Listener{[this, &remote](const Change& change) { take(remote, change); },
                         [this, number] { holds_.releaseDevice(number); },
                         [this, number] {
                           close(number);
                           // Another one may have its path by now.
                           refresh();
                         }});
  } catch (const std::system_error& error) {
    monitor_.refused(node, "cannot be read: " + error.code().message());
    remotes_.pop_back();
    return;
  }
  monitor_.opened(node);
  if (arguments_.grab) passThrough_.open();
  setGrab(remote);
}

void Receiver::close(int number) {
  const auto remote = std::ranges::find(remotes_, number, &Remote::number);
  monitor_.closed(remote->node);
  remotes_.erase(remote);
  holds_.releaseDevice(number);
  passThrough_.releaseDevice(number);
  armBounce();
}

void Receiver::setGrab(Remote& remote) {
  if (remote.device->setGrabbed(arguments_.grab && listened_ && front_.taker().empty())) return;
  monitor_.refused(remote.node, "somebody else has grabbed it");
}

void Receiver::setGrabs() {
  for (Remote& remote : remotes_) setGrab(remote);
}

void Receiver::onListener() {
  if (!port_.isOpen()) return setTimer(grace_, now() + kGrace);
  listened_ = true;
  setGrabs();
}

void Receiver::onTaker() {
  monitor_.taken(front_.taker());
  setGrabs();
}

void Receiver::take(const Remote& remote, const Change& change) {
  if (change.down) front_.refresh();
  const Key key{remote.number, change.key};
  const Node& node = remote.node;
  const remote::Button* const button = buttonOf(change.key, change.scan, {node.road, node.volumeKeys});
  if (!change.down) {
    monitor_.changed(node, change, button, {});
    passThrough_.release(key);
    holds_.release(key, change.time);
  } else if (change.stale) {
    monitor_.changed(node, change, button, "dropped, it comes too late");
  } else if (!front_.taker().empty()) {
    monitor_.changed(node, change, button, change.grabbed ? "lost" : "left to " + front_.taker());
  } else if (button == nullptr) {
    const char* const outcome = !change.grabbed           ? "left to the desktop"
                                : passThrough_.press(key) ? "handed on to the desktop"
                                                          : "lost";
    monitor_.changed(node, change, button, outcome);
  } else if (arguments_.grab && !change.grabbed && !port_.isOpen()) {
    monitor_.changed(node, change, button, "left to the desktop, nobody listens");
  } else {
    monitor_.changed(node, change, button, {});
    holds_.press(key, *button, change.time, node.road == Road::HID || node.road == Road::AVRCP);
  }
  armBounce();
}

void Receiver::say(const remote::Button& button, std::int32_t value) {
  port_.sendButton(button, value);
  monitor_.sent(button, value, port_.isOpen());
}

void Receiver::armBounce() {
  if (const auto due = holds_.due()) setTimer(bounce_, *due);
}

int Receiver::takeNotification(sd_bus_message* signal) {
  const char* name = nullptr;
  if (sd_bus_message_read(signal, "s", &name) < 0) return 0;
  if (std::string_view(name) == "com.tarn.kvd.started") port_.daemonStarted();
  if (std::string_view(name) == "com.tarn.kvd.terminated") port_.daemonEnded();
  return 0;
}

}  // namespace

int run(const Arguments& arguments) {
  const int status = Receiver(arguments).run();
  if (status < 0) throw std::system_error(-status, std::generic_category());
  return status;
}

}  // namespace receiver
