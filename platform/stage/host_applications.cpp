// Running applications, as the host interface asks for them.

#include <algorithm>
#include <string>
#include <vector>

#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/stage/desktop.h"
#include "platform/stage/journal.h"

namespace {

using stage::Entry;
using stage::Question;
using stage::record;
using stage::recordQuestion;

HostObject* copySerialNumber(const HostProcessSerialNumber& process) {
  return new base::SerialNumber(process);
}

/// One value of a process's information, owned; null for an unknown key.
HostObject* copyInformation(const stage::Process& process, HostStringRef key) {
  if (HostStringsAreEqual(key, HostGetBundleIdentifierKey())) {
    return new base::String(process.application->identifier);
  }
  if (HostStringsAreEqual(key, HostGetBundleVersionKey())) {
    return process.application->version.empty() ? nullptr : new base::String(process.application->version);
  }
  if (HostStringsAreEqual(key, HostGetSerialNumberKey())) return copySerialNumber(process.serialNumber);
  return nullptr;
}

bool matches(const stage::Process& process, std::size_t count, const HostStringRef* keys,
             HostObject* const* values) {
  for (std::size_t i = 0; i < count; ++i) {
    HostObject* const actual = copyInformation(process, keys[i]);
    const bool equal = HostStringsAreEqual(HostAsString(actual), HostAsString(values[i]));
    HostRelease(actual);
    if (!equal) return false;
  }
  return true;
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
  for (const stage::Process& process : stage::desktop().running) {
    if (!matches(process, count, keys, values)) continue;
    if (found.empty()) record(Entry::Question, "finds " + process.application->name + " running");
    found.push_back(copySerialNumber(process.serialNumber));
  }
  return HostListRef(new base::List(std::move(found)));
}

HostDictionaryRef HostCopyApplicationInformation(HostSessionID session, HostSerialNumberRef serialNumber,
                                                 HostStringRef key) {
  const stage::Process* const process = processOf(session, serialNumber);
  if (process == nullptr) return nullptr;
  HostObject* const value = copyInformation(*process, key);
  base::Dictionary::Entries entries;
  if (value != nullptr) entries.emplace_back(base::textOf(key), value);
  return HostDictionaryRef(new base::Dictionary(std::move(entries)));
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
  return copyInformation(*process, key);
}

HostSerialNumberRef HostCopyFrontApplication(HostSessionID session) {
  const auto& front = stage::desktop().front;
  if (session != kHostDefaultSession) return nullptr;
  recordQuestion(Question::WhoIsInFront,
                 "asks who is in front: " + (front ? front->application->name : std::string("nobody")),
                 front ? front->application : nullptr);
  return front ? HostSerialNumberRef(copySerialNumber(front->serialNumber)) : nullptr;
}
