// Running applications, as the host interface asks for them.

#include <algorithm>
#include <string>
#include <vector>

#include "platform/base/application_information.h"
#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/stage/desktop.h"
#include "platform/stage/journal.h"

namespace {

using stage::Entry;
using stage::Question;
using stage::record;
using stage::recordQuestion;

base::ApplicationInstance instanceOf(const stage::Process& process) {
  return {process.serialNumber, process.application->identifier, process.application->version};
}

const stage::Process* processOf(HostSessionID session, HostSerialNumberRef serialNumber) {
  const auto* const number = base::as<base::SerialNumber>(serialNumber);
  if (session != kHostDefaultSession || number == nullptr) return nullptr;
  return stage::findProcess(number->process);
}

}  // namespace

std::uint32_t HostGetApplicationListSeed(HostSessionID session) {
  return session == kHostDefaultSession ? stage::desktop().applicationListSeed : 0;
}

HostListRef HostFindRunningApplications(HostSessionID session, std::size_t count, const HostStringRef* keys,
                                        HostObject* const* values) {
  if (session != kHostDefaultSession) return nullptr;
  std::vector<HostObject*> found;
  const stage::Application* application = nullptr;
  for (const stage::Process& process : stage::desktop().running) {
    if (!base::hasInformation(instanceOf(process), count, keys, values)) continue;
    application = process.application;
    found.push_back(new base::SerialNumber(process.serialNumber));
  }
  if (application != nullptr) record(Entry::Question, "finds " + application->name + " running");
  return HostListRef(new base::List(std::move(found)));
}

HostDictionaryRef HostCopyApplicationInformation(HostSessionID session, HostSerialNumberRef serialNumber,
                                                 HostStringRef key) {
  const stage::Process* const process = processOf(session, serialNumber);
  return process != nullptr ? base::copyInformation(instanceOf(*process), key) : nullptr;
}

HostObject* HostCopyApplicationInformationItem(HostSessionID session, HostSerialNumberRef serialNumber,
                                               HostStringRef key) {
  const stage::Process* const process = processOf(session, serialNumber);
  if (process == nullptr) {
    record(Entry::Question, "asks about an application that has quit");
    return nullptr;
  }
  recordQuestion(Question::WhoRuns, "asks whether " + process->application->name + " runs: yes",
                 process->application);
  return base::copyInformationItem(instanceOf(*process), key);
}

HostSerialNumberRef HostCopyFrontApplication(HostSessionID session) {
  const auto front = stage::desktop().front;  // whoever hears of the question may change it
  if (session != kHostDefaultSession) return nullptr;
  recordQuestion(Question::WhoIsInFront,
                 "asks who is in front: " + (front ? front->application->name : std::string("nobody")),
                 front ? front->application : nullptr);
  return front ? HostSerialNumberRef(new base::SerialNumber(front->serialNumber)) : nullptr;
}
