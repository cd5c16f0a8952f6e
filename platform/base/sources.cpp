#include "platform/base/sources.h"

#include <pthread.h>
#include <sys/epoll.h>
#include <unistd.h>

#include <algorithm>
#include <utility>
#include <vector>

namespace base {
namespace {

/// One reference to each is the loop's.
std::vector<Source*> sources;
int epollDescriptor = -1;

bool watch(Source& source) {
  epoll_event interest{.events = EPOLLIN, .data = {.ptr = &source}};
  return epoll_ctl(runLoopDescriptor(), EPOLL_CTL_ADD, source.fd, &interest) == 0;
}

/// A forked child inherits its parent's set itself, no copy: what it adds and removes would be the parent's.
void renewInChild() {
  close(epollDescriptor);
  epollDescriptor = epoll_create1(EPOLL_CLOEXEC);
  for (Source* source : sources) watch(*source);
}

void add(Source& source) {
  if (source.onLoop || !watch(source)) return;
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
  if (epollDescriptor < 0) {
    epollDescriptor = epoll_create1(EPOLL_CLOEXEC);
    pthread_atfork(nullptr, nullptr, renewInChild);
  }
  return epollDescriptor;
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
