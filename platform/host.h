// Every operation that the daemon asks of the desktop it runs on.
//
// The core (daemon/ routing/ registry/ adapters/) sees the world through this header and platform/mach.h
// alone and links against whichever host implements the two.
//
// Ownership is in the name: Create, Copy and Find give the caller a reference to release, Get lends one.
// Exceptions are said at their operations. Null handles are allowed everywhere: retaining or releasing one
// does nothing, and an operation given one fails as it does for an object that is not there.
//
// All calls come on one thread.
#pragma once

#include <cstddef>
#include <cstdint>

#include "platform/mach.h"

// ---- Objects
// -------------------------------------------------------------------------------------------------

/// Any counted object of the host; what kind it is, the host knows.
struct HostObject;

/// A handle to a counted object of one kind. Copying a handle copies no reference.
template <typename Kind>
struct HostHandle {
  HostObject* object = nullptr;

  constexpr HostHandle() = default;
  constexpr HostHandle(std::nullptr_t) {}  // NOLINT(google-explicit-constructor): null is of every kind
  constexpr explicit HostHandle(HostObject* counted) : object(counted) {}
  constexpr explicit operator bool() const { return object != nullptr; }
  friend constexpr bool operator==(HostHandle, HostHandle) = default;
};

using HostStringRef = HostHandle<struct HostStringKind>;
using HostListRef = HostHandle<struct HostListKind>;
using HostDictionaryRef = HostHandle<struct HostDictionaryKind>;
using HostDataRef = HostHandle<struct HostDataKind>;
using HostLocationRef = HostHandle<struct HostLocationKind>;
using HostBundleRef = HostHandle<struct HostBundleKind>;
using HostSerialNumberRef = HostHandle<struct HostSerialNumberKind>;
using HostRunLoopRef = HostHandle<struct HostRunLoopKind>;
using HostSourceRef = HostHandle<struct HostSourceKind>;
using HostTimerRef = HostHandle<struct HostTimerKind>;
using HostPortRef = HostHandle<struct HostPortKind>;
using HostReleaseScopeRef = HostHandle<struct HostReleaseScopeKind>;
using HostScriptRef = HostHandle<struct HostScriptKind>;
using HostDescriptorRef = HostHandle<struct HostDescriptorKind>;
using HostEventSourceRef = HostHandle<struct HostEventSourceKind>;
using HostKeyEventRef = HostHandle<struct HostKeyEventKind>;

/// Adds one reference.
void HostRetain(HostObject* object);
/// Drops one reference; the last one ends the object.
void HostRelease(HostObject* object);

template <typename Kind>
void HostRetain(HostHandle<Kind> handle) {
  HostRetain(handle.object);
}
template <typename Kind>
void HostRelease(HostHandle<Kind> handle) {
  HostRelease(handle.object);
}

/// The object as a string, borrowed; null when it is of another kind.
HostStringRef HostAsString(HostObject* object);
/// The object as an application serial number, borrowed; null when it is of another kind.
HostSerialNumberRef HostAsSerialNumber(HostObject* object);

// ---- Strings, lists, dictionaries
// ----------------------------------------------------------------------------

/// The immortal string with this text (UTF-8), the same object for the same text. Never released.
HostStringRef HostGetConstantString(const char* text);
/// A temporary string that belongs to the open release scope; null when the bytes are not valid UTF-8.
HostStringRef HostCreateStringFromUTF8(const char* bytes);
/// True when both are strings with the same bytes.
bool HostStringsAreEqual(HostStringRef a, HostStringRef b);
/// The text split at every occurrence of the separator, an owned list of strings; null on failure. A text
/// without the separator, the empty one too, is a list of one.
HostListRef HostCreateListBySeparatingString(HostStringRef string, HostStringRef separator);
/// The decimal integer that the text begins with, after blanks; 0 where there is none, the nearest bound
/// where it does not fit.
std::int32_t HostStringIntegerValue(HostStringRef string);

/// How many items the list holds; 0 for null.
std::size_t HostListGetCount(HostListRef list);
/// An item of the list, borrowed; null out of range.
HostObject* HostListGetItem(HostListRef list, std::size_t index);
/// The value under a key, borrowed; null when there is none.
HostObject* HostDictionaryGetValue(HostDictionaryRef dictionary, HostStringRef key);

// ---- Run loop and time
// ---------------------------------------------------------------------------------------

/// The modes a run loop can run in: the default one alone.
enum class HostRunLoopMode { Default };

/// Called with the timer and the context given at its creation.
using HostTimerCallback = void (*)(HostTimerRef timer, void* context);

/// Seconds on the host's clock, which never jumps and goes on while the machine sleeps.
double HostAbsoluteTime();
/// Waits for so many microseconds; the run loop stands still meanwhile.
void HostSleepMicroseconds(std::uint32_t microseconds);

/// The calling thread's run loop, borrowed.
HostRunLoopRef HostRunLoopCurrent();
/// Puts a source on the loop, or does nothing when it is on already. A source with data waiting fires at
/// once.
void HostRunLoopAddSource(HostRunLoopRef loop, HostSourceRef source, HostRunLoopMode mode);
/// Takes a source off the loop; allowed from inside its own callback.
void HostRunLoopRemoveSource(HostRunLoopRef loop, HostSourceRef source, HostRunLoopMode mode);
/// Runs the calling thread's loop until it is stopped. A loop never runs inside itself: such a call returns
/// at once.
void HostRunLoopRun();
/// Makes the loop return after the callback in progress; nothing more is delivered.
void HostRunLoopStop(HostRunLoopRef loop);
/// A timer that fires at firstFireDate and then every interval seconds on the clock of HostAbsoluteTime; null
/// on failure (an interval that is not positive, a time that is not a number). Firings that were missed are
/// dropped: a late timer fires once and keeps its schedule.
HostTimerRef HostCreateRepeatingTimer(double firstFireDate, double interval, HostTimerCallback callback,
                                      void* context);
/// Starts the timer on the loop.
void HostRunLoopAddTimer(HostRunLoopRef loop, HostTimerRef timer, HostRunLoopMode mode);
/// Takes the timer off its loop for ever; allowed from inside its own callback.
void HostInvalidateTimer(HostTimerRef timer);

// ---- Service and messages
// ------------------------------------------------------------------------------------

/// Called with one received message (header first) of `size` bytes, valid during the call.
using HostPortCallback = void (*)(HostPortRef port, void* message, std::size_t size, void* context);

/// Wraps the receive right of a port that was checked in. Messages longer than largestMessage bytes or
/// shorter than a header are dropped, and so are those of other users. Null on failure.
HostPortRef HostCreatePort(mach_port_t port, std::size_t largestMessage, HostPortCallback callback,
                           void* context);
/// A run-loop source that delivers the port's messages one at a time; `order` ranks sources that are ready
/// together, lowest first. Null on failure.
HostSourceRef HostCreatePortSource(HostPortRef port, std::int32_t order);
/// Swaps a numbered setting of the service manager for this process. 0 on success, the old value in
/// *previous.
std::int32_t HostEnableServiceTransactions(std::int32_t setting, std::int64_t value, std::int64_t* previous);
/// Tells every interested process of the session that `name` happened to `object`; userInformation may be
/// null.
void HostPostDistributedNotification(HostStringRef name, HostStringRef object,
                                     HostDictionaryRef userInformation, bool deliverImmediately);

// ---- Window server and input events
// --------------------------------------------------------------------------

using HostConnectionID = std::uint32_t;
using HostDisplayID = std::uint32_t;

/// A process as the window server names it.
struct HostProcessSerialNumber {
  std::uint32_t high = 0;
  std::uint32_t low = 0;
  friend constexpr bool operator==(const HostProcessSerialNumber&, const HostProcessSerialNumber&) = default;
};

/// Virtual key codes: the keys that the daemon presses and the few more that hosts must tell apart.
namespace HostVirtualKey {
inline constexpr std::uint16_t S = 1;
inline constexpr std::uint16_t Return = 36;
inline constexpr std::uint16_t Tab = 48;
inline constexpr std::uint16_t Space = 49;
inline constexpr std::uint16_t Escape = 53;
inline constexpr std::uint16_t Shift = 56;
inline constexpr std::uint16_t LeftArrow = 123;
inline constexpr std::uint16_t RightArrow = 124;
inline constexpr std::uint16_t DownArrow = 125;
inline constexpr std::uint16_t UpArrow = 126;
}  // namespace HostVirtualKey

/// The process's connection to the window server, 0 on failure.
HostConnectionID HostConnectWindowServer();
/// How many seconds the user's own input is held back after a synthetic event. 0 on success.
std::int32_t HostSetLocalEventsSuppressionInterval(HostConnectionID connection, double seconds);
/// Clears an event record of `length` bytes and writes its length at offset 4. 0 on success.
std::int32_t HostClearEventRecord(void* record, std::uint32_t length);
/// Posts an event record to the window server. 0 on success.
std::int32_t HostPostEventRecord(HostConnectionID connection, const void* record, std::uint32_t length,
                                 std::int32_t options);
/// A source of synthetic events with key state of its own; null on failure.
HostEventSourceRef HostCreatePrivateEventSource();
/// A press (down) or release of a virtual key; null on failure.
HostKeyEventRef HostCreateKeyboardEvent(HostEventSourceRef source, std::uint16_t virtualKey, bool down);
/// Delivers an event to one process and to nobody else.
void HostPostEventToProcess(const HostProcessSerialNumber& process, HostKeyEventRef event);
/// Looks up the running process with this bundle identifier. 0 on success; *found is non-zero and *process
/// filled in when there is one.
std::int32_t HostFindProcessByBundleIdentifier(HostStringRef bundleIdentifier, std::uint32_t option,
                                               HostProcessSerialNumber* process, std::uint8_t* found);
/// Writes at most `capacity` active displays and their count. 0 on success.
std::int32_t HostGetActiveDisplayList(std::uint32_t capacity, HostDisplayID* displays, std::uint32_t* count);
/// Non-zero while some application has the display for itself.
std::uint32_t HostDisplayIsCaptured(HostDisplayID display);

// ---- Running applications
// ------------------------------------------------------------------------------------

using HostSessionID = std::int32_t;

/// The session of the calling user.
inline constexpr HostSessionID kHostDefaultSession = -2;

/// Information key: the application's bundle identifier, a string.
HostStringRef HostGetBundleIdentifierKey();
/// Information key: the application's bundle version, a string.
HostStringRef HostGetBundleVersionKey();
/// Information key: the instance's serial number.
HostStringRef HostGetSerialNumberKey();

/// A counter that changes whenever the set of running applications does.
std::uint32_t HostGetApplicationListSeed(HostSessionID session);
/// The serial numbers of the running applications whose information has every given value under its key, an
/// owned list in the host's order; null on failure.
HostListRef HostFindRunningApplications(HostSessionID session, std::size_t count, const HostStringRef* keys,
                                        HostObject* const* values);
/// An owned copy of a serial number.
HostSerialNumberRef HostCopyApplicationSerialNumber(HostSerialNumberRef serialNumber);
/// An owned dictionary of the instance's information with at least the wanted key; null when it is gone.
HostDictionaryRef HostCopyApplicationInformation(HostSessionID session, HostSerialNumberRef serialNumber,
                                                 HostStringRef key);
/// One owned value of the instance's information; null when the instance is gone or has no such value.
HostObject* HostCopyApplicationInformationItem(HostSessionID session, HostSerialNumberRef serialNumber,
                                               HostStringRef key);
/// The serial number of the frontmost application, owned; null when there is none.
HostSerialNumberRef HostCopyFrontApplication(HostSessionID session);
/// Splits a serial number into the two words of the process's own. 1 on success; any other answer is a
/// failure.
std::uint32_t HostExtractSerialNumberParts(HostSerialNumberRef serialNumber, std::uint32_t* high,
                                           std::uint32_t* low);

/// The bundle in a directory, owned; null when there is none.
HostBundleRef HostCreateBundle(const char* directory);
/// Where a bundle keeps the resource of this name and type, owned; a null subdirectory is the top. Null when
/// it has no such resource.
HostLocationRef HostCopyBundleResourceLocation(HostBundleRef bundle, HostStringRef name, HostStringRef type,
                                               HostStringRef subdirectory);
/// The bytes at a location, owned by the caller; null when they cannot be read.
HostDataRef HostReadResourceData(HostLocationRef location);
/// A property list as an immutable dictionary, owned by the caller; null when the data are no property list
/// of a dictionary. *errorText, where asked for, is an owned string then.
HostDictionaryRef HostParsePropertyList(HostDataRef data, HostStringRef* errorText);

// ---- Scripting and inter-application events
// ------------------------------------------------------------------

/// Opens a scope that collects the temporary objects made until it is closed. Scopes nest; the caller closes
/// it.
HostReleaseScopeRef HostOpenReleaseScope();
/// Releases the scope and every temporary object made in it.
void HostCloseReleaseScope(HostReleaseScopeRef scope);
/// A script with this source text, not yet compiled; owned, null on failure.
HostScriptRef HostCreateScript(HostStringRef source);
/// Compiles and runs a script to its end. The result is temporary: it belongs to the open release scope. Null
/// on an error, with an error record (temporary too) in *error.
HostDescriptorRef HostExecuteScript(HostScriptRef script, HostDictionaryRef* error);
/// The value as a signed 32-bit integer: true is 1, a real loses its fraction; 0 when it is no number.
std::int32_t HostDescriptorInt32Value(HostDescriptorRef descriptor);
/// The value as a four-character type code; 0 when it is none.
std::uint32_t HostDescriptorTypeCodeValue(HostDescriptorRef descriptor);

/// A piece of an inter-application event, or an event itself; disposed of, not released.
struct HostEventDescriptor {
  std::uint32_t type = 0;
  HostObject* contents = nullptr;
};

/// Makes a descriptor of `size` bytes of data. 0 on success.
std::int16_t HostCreateDescriptor(std::uint32_t type, const void* data, std::size_t size,
                                  HostEventDescriptor* descriptor);
/// Makes an event for a target. Return id −1 has one made up, transaction id 0 means none. 0 on success.
std::int16_t HostCreateEvent(std::uint32_t eventClass, std::uint32_t eventID,
                             const HostEventDescriptor* target, std::int16_t returnID,
                             std::int32_t transactionID, HostEventDescriptor* event);
/// Sends an event. Mode 1 wants no reply, time-out −1 is the host's own. 0 on success.
std::int32_t HostSendEvent(const HostEventDescriptor* event, HostEventDescriptor* reply,
                           std::int32_t sendMode, std::int32_t timeout);
/// Gives a descriptor's contents back and empties it. 0 on success.
std::int16_t HostDisposeDescriptor(HostEventDescriptor* descriptor);
