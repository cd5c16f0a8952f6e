// The rest of the host interface: the service manager, notifications, inter-application events.

#include <map>
#include <string>

#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/stage/desktop.h"
#include "platform/stage/four_char_code.h"
#include "platform/stage/journal.h"

namespace {

using stage::Entry;
using stage::record;

constexpr std::int32_t kTransactionTracking = 16;
constexpr std::int32_t kNoSuchProcess = -600;
constexpr std::int32_t kBadEvent = -50;
constexpr std::int32_t kNoReply = 1;
constexpr std::int32_t kOwnTimeOut = -1;

}  // namespace

std::int32_t HostEnableServiceTransactions(std::int32_t setting, std::int64_t value, std::int64_t* previous) {
  static std::map<std::int32_t, std::int64_t> sSettings;
  if (setting != kTransactionTracking) return -1;
  std::int64_t& current = sSettings[setting];
  if (previous != nullptr) *previous = current;
  current = value;
  record(Entry::Service, std::string("service transactions ") + (value != 0 ? "on" : "off"));
  return 0;
}

void HostPostDistributedNotification(HostStringRef name, HostStringRef object,
                                     HostDictionaryRef userInformation, bool deliverImmediately) {
  record(Entry::Notification, "notification " + base::textOf(name) + " of " + base::textOf(object) +
                                  (userInformation ? " with information" : "") +
                                  (deliverImmediately ? " at once" : ""));
}

std::int32_t HostSendEvent(const HostEventDescriptor* event, HostEventDescriptor*, std::int32_t sendMode,
                           std::int32_t timeout) {
  const auto target = base::targetOf(event);
  if (!target) return kBadEvent;
  const stage::Process* const process = stage::findProcess(*target);
  if (process == nullptr) return kNoSuchProcess;
  const auto* const contents = base::as<base::EventContents>(event->contents);
  stage::Application& application = *process->application;
  const bool usual = contents->returnID > 0 && contents->transactionID == 0 && sendMode == kNoReply &&
                     timeout == kOwnTimeOut;
  record(Entry::Event, "event " + stage::quoted(contents->eventClass) + "/" +
                           stage::quoted(contents->eventID) + " to " + application.name +
                           (usual ? "" : ", with a reply, a time or an id of its own"));
  application.receiveEvent(contents->eventClass, contents->eventID);
  return 0;
}
