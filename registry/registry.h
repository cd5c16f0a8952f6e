// Which of the known applications run, and as which instance.
//
// One slot per known application caches the serial number of its running instance. The slots are refreshed
// together, at start-up and whenever the platform's application list has changed; between two refreshes a
// slot may name an instance that has quit, and miss one that has started.
#pragma once

#include <cstdint>

#include "daemon/kvd.h"

/// Replaces all cached serial numbers by a fresh search for each.
void refreshCachedASNs();

/// A fresh search: the serial number of the first running instance, owned by the caller, or null.
HostSerialNumberRef _getASNForBundleID(HostStringRef bundleIdentifier);
/// The cached serial number of a known application, not owned; null when it was not running at the last
/// refresh or the identifier, compared exactly, is not a known one.
HostSerialNumberRef getASNForBundleID(HostStringRef bundleIdentifier);

/// Whether the platform still knows this instance; false for null.
bool ProcessIsRunning(HostSerialNumberRef serialNumber);

bool LyraboxIsRunning();
bool SnapvaleIsRunning();
bool LumbraIsRunning();
bool SpindleIsRunning();
bool VistremePlayerIsRunning();
bool VistremePlayerXIsRunning();
bool SlidewellIsRunning();
bool DaemonIsRunning();

/// The code of the frontmost application, App::None if it is none of the seven. Target selection asks a
/// question of its own, in another order; nothing in the daemon calls this one.
AppCode FrontProcessID();

/// The major version of the running consumer photo library, 0 when unknown.
std::int32_t getSnapvaleVersion();

/// A bundle's resource of type "plist" as a dictionary owned by the caller, or null.
HostDictionaryRef CreateDictionaryFromPList(HostBundleRef bundle, HostStringRef resourceName);
