// The one way in which commands leave for applications: a script that is compiled and run, or an event to a
// running instance that waits for no reply. Nothing is kept between calls and no failure is reported.
#pragma once

#include <cstdint>

#include "daemon/kvd.h"

extern "C" {

/// Runs a script (UTF-8, may be null). The result belongs to the caller, who releases it; null when nothing
/// could be run, the run failed or nothing came of it.
HostDescriptorRef HandleScriptWithResult(const char* source);

/// Runs a script for what it does.
void HandleScript(const char* source);

/// Runs a script for its result as a signed 32-bit integer, a boolean as 1 or 0; 0 when there is no result.
std::intptr_t HandleScriptWithIntegerResult(const char* source);

/// Runs a script for its result as a four-character code; 0 when there is none.
FourCharCode HandleScriptWithOSTypeResult(const char* source);

/// Sends an event to the instance that the registry has cached for this bundle identifier, if any.
void HandleTarnEventWithCode(HostStringRef bundleIdentifier, FourCharCode eventClass, FourCharCode eventID);
}
