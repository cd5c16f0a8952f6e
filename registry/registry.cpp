#include "registry/registry.h"

namespace {

HostSerialNumberRef sLyraboxASN;
HostSerialNumberRef sSnapvaleASN;
HostSerialNumberRef sLumbraASN;
HostSerialNumberRef sSpindleASN;
HostSerialNumberRef sVistremePlayerXASN;
HostSerialNumberRef sVistremePlayerASN;
HostSerialNumberRef sSlidewellASN;
HostSerialNumberRef sDaemonASN;

struct Slot {
  const char* bundleIdentifier;
  HostSerialNumberRef* serialNumber;
};

HostSerialNumberRef* const kReleaseOrder[] = {
    &sLyraboxASN,        &sSnapvaleASN,        &sLumbraASN,    &sSpindleASN,
    &sVistremePlayerASN, &sVistremePlayerXASN, &sSlidewellASN, &sDaemonASN,
};

const Slot kRefillOrder[] = {
    {Bundle::Lyrabox, &sLyraboxASN},
    {Bundle::Snapvale, &sSnapvaleASN},
    {Bundle::Lumbra, &sLumbraASN},
    {Bundle::Spindle, &sSpindleASN},
    {Bundle::VistremePlayerX, &sVistremePlayerXASN},
    {Bundle::VistremePlayer, &sVistremePlayerASN},
    {Bundle::Slidewell, &sSlidewellASN},
    {Bundle::Daemon, &sDaemonASN},
};

const Slot kLookUpOrder[] = {
    {Bundle::Lyrabox, &sLyraboxASN},
    {Bundle::Snapvale, &sSnapvaleASN},
    {Bundle::Lumbra, &sLumbraASN},
    {Bundle::Spindle, &sSpindleASN},
    {Bundle::VistremePlayerX, &sVistremePlayerXASN},
    {Bundle::VistremePlayer, &sVistremePlayerASN},
    {Bundle::Slidewell, &sSlidewellASN},
    {Bundle::Daemon, &sDaemonASN},
};

struct FrontRow {
  const char* bundleIdentifier;
  AppCode code;
};

constexpr FrontRow kFrontProcessOrder[] = {
    {Bundle::Lyrabox, App::Lyra},   {Bundle::Snapvale, App::Snap},        {Bundle::Lumbra, App::Lumb},
    {Bundle::Spindle, App::Spin},   {Bundle::VistremePlayerX, App::VstX}, {Bundle::VistremePlayer, App::Vist},
    {Bundle::Slidewell, App::Slid},
};

}  // namespace

HostSerialNumberRef _getASNForBundleID(HostStringRef bundleIdentifier) {
  const HostStringRef key = HostGetBundleIdentifierKey();
  HostObject* const value = bundleIdentifier.object;
  const HostListRef running = HostFindRunningApplications(kHostDefaultSession, 1, &key, &value);
  if (!running) return nullptr;
  HostSerialNumberRef copy;
  if (HostListGetCount(running) > 0) {
    copy = HostCopyApplicationSerialNumber(HostAsSerialNumber(HostListGetItem(running, 0)));
  }
  HostRelease(running);
  return copy;
}

void refreshCachedASNs() {
  for (HostSerialNumberRef* serialNumber : kReleaseOrder) {
    HostRelease(*serialNumber);
    *serialNumber = nullptr;
  }
  for (const Slot& slot : kRefillOrder) {
    *slot.serialNumber = _getASNForBundleID(HostGetConstantString(slot.bundleIdentifier));
  }
}

HostSerialNumberRef getASNForBundleID(HostStringRef bundleIdentifier) {
  for (const Slot& slot : kLookUpOrder) {
    if (HostStringsAreEqual(bundleIdentifier, HostGetConstantString(slot.bundleIdentifier))) {
      return *slot.serialNumber;
    }
  }
  return nullptr;
}

bool ProcessIsRunning(HostSerialNumberRef serialNumber) {
  if (!serialNumber) return false;
  HostObject* const known =
      HostCopyApplicationInformationItem(kHostDefaultSession, serialNumber, HostGetSerialNumberKey());
  if (known == nullptr) return false;
  HostRelease(known);
  return true;
}

bool LyraboxIsRunning() { return ProcessIsRunning(sLyraboxASN); }
bool SnapvaleIsRunning() { return ProcessIsRunning(sSnapvaleASN); }
bool LumbraIsRunning() { return ProcessIsRunning(sLumbraASN); }
bool SpindleIsRunning() { return ProcessIsRunning(sSpindleASN); }
bool VistremePlayerIsRunning() { return ProcessIsRunning(sVistremePlayerASN); }
bool VistremePlayerXIsRunning() { return ProcessIsRunning(sVistremePlayerXASN); }
bool SlidewellIsRunning() { return ProcessIsRunning(sSlidewellASN); }
bool DaemonIsRunning() { return ProcessIsRunning(sDaemonASN); }

AppCode FrontProcessID() {
  const HostSerialNumberRef front = HostCopyFrontApplication(kHostDefaultSession);
  if (!front) return App::None;
  const HostStringRef key = HostGetBundleIdentifierKey();
  const HostDictionaryRef information = HostCopyApplicationInformation(kHostDefaultSession, front, key);
  if (!information) {
    HostRelease(front);
    return App::None;
  }
  const HostStringRef identifier = HostAsString(HostDictionaryGetValue(information, key));
  AppCode code = App::None;
  for (const FrontRow& row : kFrontProcessOrder) {
    if (HostStringsAreEqual(identifier, HostGetConstantString(row.bundleIdentifier))) {
      code = row.code;
      break;
    }
  }
  HostRelease(front);
  HostRelease(information);
  return code;
}

std::int32_t getSnapvaleVersion() {
  // Neither the serial number nor the list of pieces is given back: intended, and seen as such by whoever
  // counts what is alive.
  const HostSerialNumberRef serialNumber = _getASNForBundleID(HostGetConstantString(Bundle::Snapvale));
  if (!serialNumber) return 0;
  const HostStringRef key = HostGetBundleVersionKey();
  const HostDictionaryRef information =
      HostCopyApplicationInformation(kHostDefaultSession, serialNumber, key);
  if (!information) return 0;
  std::int32_t major = 0;
  const HostStringRef version = HostAsString(HostDictionaryGetValue(information, key));
  if (version) {
    const HostListRef pieces = HostCreateListBySeparatingString(version, HostGetConstantString("."));
    if (pieces) major = HostStringIntegerValue(HostAsString(HostListGetItem(pieces, 0)));
  }
  HostRelease(information);
  return major;
}

HostDictionaryRef CreateDictionaryFromPList(HostBundleRef bundle, HostStringRef resourceName) {
  const HostLocationRef location =
      HostCopyBundleResourceLocation(bundle, resourceName, HostGetConstantString("plist"), nullptr);
  if (!location) return nullptr;
  HostDictionaryRef dictionary;
  const HostDataRef data = HostReadResourceData(location);
  if (data) dictionary = HostParsePropertyList(data, nullptr);
  HostRelease(location);
  HostRelease(data);
  return dictionary;
}
