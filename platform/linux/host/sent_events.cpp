// Inter-application events, as the host interface sends them.

#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/linux/programs/running.h"
#include "platform/tarnscript/tarnscript.h"

namespace {

namespace programs = linux::programs;
using programs::Instance;

constexpr std::uint32_t kHookClass = tarnscript::code("hook");
constexpr std::uint32_t kRemoteSelect = tarnscript::code("RSel");

// Results of HostSendEvent other than success.
constexpr std::int32_t kNoSuchProcess = -600;
constexpr std::int32_t kBadEvent = -50;
constexpr std::int32_t kNotUnderstood = -1708;

}  // namespace

std::int32_t HostSendEvent(const HostEventDescriptor* event, HostEventDescriptor*, std::int32_t,
                           std::int32_t) {
  const auto target = base::targetOf(event);
  if (!target) return kBadEvent;
  const Instance* const instance = programs::findInstance(*target);
  if (instance == nullptr) return kNoSuchProcess;
  const auto* const contents = base::as<base::EventContents>(event->contents);
  if (contents->eventClass != kHookClass || contents->eventID != kRemoteSelect) return kNotUnderstood;
  // Of several in its role the core knows the one that was first when the list last changed.
  const Instance* const first = programs::firstInstance(instance->role);
  programs::bringToFront(first != nullptr ? *first : *instance);
  return 0;
}
