#include "platform/base/sources.h"

#include <sys/epoll.h>

#include <algorithm>
#include <utility>
#include <vector>

namespace base {
namespace {

/// One reference to each is the loop's.
std::vector<Source*> sources;

void add(Source& source) {
  epoll_event interest{.events = EPOLLIN, .data = {.ptr = &source}};
  if (source.onLoop || epoll_ctl(runLoopDescriptor(), EPOLL_CTL_ADD, source.fd, &interest) != 0) return;
  HostRetain(&source);
  sources.push_back(&source);
  source.onLoop = true;
}

void remove(Source& source) {
  if (!source.onLoop) return;
  epoll_ctl(runLoopDescriptor(), EPOLL_CTL_DEL, source.fd, nullptr);
  std::erase(sources, &source);
  source.onLoop = false;
  HostRelease(&source);
}

/// Everything ready at this moment. One is served and the rest is asked again: what a callback takes off the
/// loop can then never be served from an old answer.
std::vector<Source*> readySources() {
  std::vector<Source*> ready;
  for (Source* source : sources) {
    if (source->prepare && source->prepare()) ready.push_back(source);
  }
  std::vector<epoll_event> events(std::max<std::size_t>(sources.size(), 1));
  const int count = epoll_wait(runLoopDescriptor(), events.data(), static_cast<int>(events.size()), 0);
  for (int i = 0; i < count; ++i) {
    ready.push_back(static_cast<Source*>(events[static_cast<std::size_t>(i)].data.ptr));
  }
  return ready;
}

}  // namespace

int runLoopDescriptor() {
  static const int descriptor = epoll_create1(EPOLL_CLOEXEC);
  return descriptor;
}

Source::Source(int descriptor, std::int32_t rank, std::function<void()> callback)
    : HostObject(kKind), fd(descriptor), order(rank), ready(std::move(callback)) {}

Source* nextReadySource() {
  static std::uint64_t turn = 0;
  const std::vector<Source*> ready = readySources();
  const auto next = std::ranges::min_element(
      ready, {}, [](const Source* source) { return std::pair(source->order, source->served); });
  if (next == ready.end()) return nullptr;
  (*next)->served = ++turn;
  return *next;
}

}  // namespace base

void HostRunLoopAddSource(HostRunLoopRef loop, HostSourceRef source, HostRunLoopMode) {
  auto* added = base::as<base::Source>(source);
  if (loop && added != nullptr) base::add(*added);
}

void HostRunLoopRemoveSource(HostRunLoopRef loop, HostSourceRef source, HostRunLoopMode) {
  auto* removed = base::as<base::Source>(source);
  if (loop && removed != nullptr) base::remove(*removed);
}
