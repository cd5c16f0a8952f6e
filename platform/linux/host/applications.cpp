// Running applications, as the host interface asks for them.

#include <utility>
#include <vector>

#include "platform/base/application_information.h"
#include "platform/base/values.h"
#include "platform/host.h"
#include "platform/linux/host/listener.h"
#include "platform/linux/programs/running.h"

namespace {

namespace programs = linux::programs;
using programs::Instance;
using programs::Role;

/// Photo programs are spoken to in the words of this generation, which asks whether a slide show runs.
constexpr const char* kPhotoLibraryVersion = "8.0";

linux::host::Listener sListener;

base::ApplicationInstance informationOf(const Instance& instance) {
  return {instance.serialNumber, programs::bundleIdentifier(instance.role),
          instance.role == Role::PhotoLibrary ? kPhotoLibraryVersion : ""};
}

/// As the list stands: a button asks about every program several times, and has asked for the seed before.
const Instance* instanceOf(HostSessionID session, HostSerialNumberRef serialNumber) {
  const auto* const number = base::as<base::SerialNumber>(serialNumber);
  if (session != kHostDefaultSession || number == nullptr) return nullptr;
  return programs::findInstance(number->process);
}

}  // namespace

void linux::host::setListener(Listener listener) { sListener = std::move(listener); }

std::uint32_t HostGetApplicationListSeed(HostSessionID session) {
  if (session != kHostDefaultSession) return 0;
  programs::takeInDesktop();
  return programs::applicationListSeed();
}

HostListRef HostFindRunningApplications(HostSessionID session, std::size_t count, const HostStringRef* keys,
                                        HostObject* const* values) {
  if (session != kHostDefaultSession) return nullptr;
  programs::takeInDesktop();
  std::vector<HostObject*> found;
  // Role by role, so that the instances of each come in their own order.
  for (const Role role : programs::kRoles) {
    for (const Instance* instance : programs::rankedInstances(role)) {
      if (base::hasInformation(informationOf(*instance), count, keys, values)) {
        found.push_back(new base::SerialNumber(instance->serialNumber));
      }
    }
  }
  return HostListRef(new base::List(std::move(found)));
}

HostDictionaryRef HostCopyApplicationInformation(HostSessionID session, HostSerialNumberRef serialNumber,
                                                 HostStringRef key) {
  const Instance* const instance = instanceOf(session, serialNumber);
  return instance != nullptr ? base::copyInformation(informationOf(*instance), key) : nullptr;
}

HostObject* HostCopyApplicationInformationItem(HostSessionID session, HostSerialNumberRef serialNumber,
                                               HostStringRef key) {
  const Instance* const instance = instanceOf(session, serialNumber);
  if (instance == nullptr) return nullptr;
  if (sListener.whoRuns) sListener.whoRuns(instance->role);
  return base::copyInformationItem(informationOf(*instance), key);
}

HostSerialNumberRef HostCopyFrontApplication(HostSessionID session) {
  if (session != kHostDefaultSession) return nullptr;
  programs::takeInDesktop();
  const Instance* const front = programs::frontInstance();
  if (sListener.whoIsInFront) sListener.whoIsInFront(front != nullptr ? front->role : Role::None);
  return front != nullptr ? HostSerialNumberRef(new base::SerialNumber(front->serialNumber)) : nullptr;
}
