// A host on which every operation fails: the proof that the core needs nothing but the seam, and the mirror
// in which its failure rules show.

#include "platform/host.h"

const NDR_record_t NDR_record = {0, 0, 0, 0, NDR_INT_LITTLE_ENDIAN, 0, 0, 0};

mach_port_t mach_task_self() { return MACH_PORT_NULL; }
kern_return_t task_get_special_port(mach_port_t, int, mach_port_t*) { return KERN_FAILURE; }
kern_return_t bootstrap_check_in(mach_port_t, const char*, mach_port_t*) { return KERN_FAILURE; }
kern_return_t bootstrap_look_up(mach_port_t, const char*, mach_port_t*) { return BOOTSTRAP_UNKNOWN_SERVICE; }
mach_msg_return_t mach_msg(mach_msg_header_t*, mach_msg_option_t, mach_msg_size_t, mach_msg_size_t,
                           mach_port_t, mach_msg_timeout_t, mach_port_t) {
  return MACH_SEND_INVALID_DEST;
}

void HostRetain(HostObject*) {}
void HostRelease(HostObject*) {}
HostStringRef HostAsString(HostObject*) { return nullptr; }
HostSerialNumberRef HostAsSerialNumber(HostObject*) { return nullptr; }

HostStringRef HostGetConstantString(const char*) { return nullptr; }
HostStringRef HostCreateStringFromUTF8(const char*) { return nullptr; }
bool HostStringsAreEqual(HostStringRef, HostStringRef) { return false; }
HostListRef HostCreateListBySeparatingString(HostStringRef, HostStringRef) { return nullptr; }
std::int32_t HostStringIntegerValue(HostStringRef) { return 0; }
std::size_t HostListGetCount(HostListRef) { return 0; }
HostObject* HostListGetItem(HostListRef, std::size_t) { return nullptr; }
HostObject* HostDictionaryGetValue(HostDictionaryRef, HostStringRef) { return nullptr; }

double HostAbsoluteTime() { return 0; }
void HostSleepMicroseconds(std::uint32_t) {}
HostRunLoopRef HostRunLoopCurrent() { return nullptr; }
void HostRunLoopAddSource(HostRunLoopRef, HostSourceRef, HostRunLoopMode) {}
void HostRunLoopRemoveSource(HostRunLoopRef, HostSourceRef, HostRunLoopMode) {}
void HostRunLoopRun() {}
void HostRunLoopStop(HostRunLoopRef) {}
HostTimerRef HostCreateRepeatingTimer(double, double, HostTimerCallback, void*) { return nullptr; }
void HostRunLoopAddTimer(HostRunLoopRef, HostTimerRef, HostRunLoopMode) {}
void HostInvalidateTimer(HostTimerRef) {}

HostPortRef HostCreatePort(mach_port_t, std::size_t, HostPortCallback, void*) { return nullptr; }
HostSourceRef HostCreatePortSource(HostPortRef, std::int32_t) { return nullptr; }
std::int32_t HostEnableServiceTransactions(std::int32_t, std::int64_t, std::int64_t*) { return -1; }
void HostPostDistributedNotification(HostStringRef, HostStringRef, HostDictionaryRef, bool) {}

HostConnectionID HostConnectWindowServer() { return 0; }
std::int32_t HostSetLocalEventsSuppressionInterval(HostConnectionID, double) { return -1; }
std::int32_t HostClearEventRecord(void*, std::uint32_t) { return -1; }
std::int32_t HostPostEventRecord(HostConnectionID, const void*, std::uint32_t, std::int32_t) { return -1; }
HostEventSourceRef HostCreatePrivateEventSource() { return nullptr; }
HostKeyEventRef HostCreateKeyboardEvent(HostEventSourceRef, std::uint16_t, bool) { return nullptr; }
void HostPostEventToProcess(const HostProcessSerialNumber&, HostKeyEventRef) {}
std::int32_t HostFindProcessByBundleIdentifier(HostStringRef, std::uint32_t, HostProcessSerialNumber*,
                                               std::uint8_t*) {
  return -1;
}
std::int32_t HostGetActiveDisplayList(std::uint32_t, HostDisplayID*, std::uint32_t*) { return -1; }
std::uint32_t HostDisplayIsCaptured(HostDisplayID) { return 0; }

HostStringRef HostGetBundleIdentifierKey() { return nullptr; }
HostStringRef HostGetBundleVersionKey() { return nullptr; }
HostStringRef HostGetSerialNumberKey() { return nullptr; }
std::uint32_t HostGetApplicationListSeed(HostSessionID) { return 0; }
HostListRef HostFindRunningApplications(HostSessionID, std::size_t, const HostStringRef*,
                                        HostObject* const*) {
  return nullptr;
}
HostSerialNumberRef HostCopyApplicationSerialNumber(HostSerialNumberRef) { return nullptr; }
HostDictionaryRef HostCopyApplicationInformation(HostSessionID, HostSerialNumberRef, HostStringRef) {
  return nullptr;
}
HostObject* HostCopyApplicationInformationItem(HostSessionID, HostSerialNumberRef, HostStringRef) {
  return nullptr;
}
HostSerialNumberRef HostCopyFrontApplication(HostSessionID) { return nullptr; }
std::uint32_t HostExtractSerialNumberParts(HostSerialNumberRef, std::uint32_t*, std::uint32_t*) { return 0; }
HostBundleRef HostCreateBundle(const char*) { return nullptr; }
HostLocationRef HostCopyBundleResourceLocation(HostBundleRef, HostStringRef, HostStringRef, HostStringRef) {
  return nullptr;
}
HostDataRef HostReadResourceData(HostLocationRef) { return nullptr; }
HostDictionaryRef HostParsePropertyList(HostDataRef, HostStringRef*) { return nullptr; }

HostReleaseScopeRef HostOpenReleaseScope() { return nullptr; }
void HostCloseReleaseScope(HostReleaseScopeRef) {}
HostScriptRef HostCreateScript(HostStringRef) { return nullptr; }
HostDescriptorRef HostExecuteScript(HostScriptRef, HostDictionaryRef*) { return nullptr; }
std::int32_t HostDescriptorInt32Value(HostDescriptorRef) { return 0; }
std::uint32_t HostDescriptorTypeCodeValue(HostDescriptorRef) { return 0; }
std::int16_t HostCreateDescriptor(std::uint32_t, const void*, std::size_t, HostEventDescriptor*) {
  return -1;
}
std::int16_t HostCreateEvent(std::uint32_t, std::uint32_t, const HostEventDescriptor*, std::int16_t,
                             std::int32_t, HostEventDescriptor*) {
  return -1;
}
std::int32_t HostSendEvent(const HostEventDescriptor*, HostEventDescriptor*, std::int32_t, std::int32_t) {
  return -1;
}
std::int16_t HostDisposeDescriptor(HostEventDescriptor*) { return -1; }
