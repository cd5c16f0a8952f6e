// Stands between the core and the host: the core is compiled once more with this header in front of each
// file.
//
// Every operation of the seam that can fail asks first whether it does, one row an operation, with what its
// failure reads as; and what goes to a process is told.
#pragma once

#include "platform/host.h"
#include "simulator/operations.h"

#define OR_FAIL(failure, operation, ...)                                                 \
  (simulator::fails(#operation) ? static_cast<decltype(operation(__VA_ARGS__))>(failure) \
                                : operation(__VA_ARGS__))

// clang-format off
#define task_get_special_port(...)                 OR_FAIL(KERN_FAILURE, task_get_special_port, __VA_ARGS__)
#define bootstrap_check_in(...)                    OR_FAIL(KERN_FAILURE, bootstrap_check_in, __VA_ARGS__)
#define HostCreateStringFromUTF8(...)              OR_FAIL(nullptr, HostCreateStringFromUTF8, __VA_ARGS__)
#define HostCreateListBySeparatingString(...)      OR_FAIL(nullptr, HostCreateListBySeparatingString, __VA_ARGS__)
#define HostListGetItem(...)                       OR_FAIL(nullptr, HostListGetItem, __VA_ARGS__)
#define HostDictionaryGetValue(...)                OR_FAIL(nullptr, HostDictionaryGetValue, __VA_ARGS__)
#define HostCreateRepeatingTimer(...)              OR_FAIL(nullptr, HostCreateRepeatingTimer, __VA_ARGS__)
#define HostCreatePort(...)                        OR_FAIL(nullptr, HostCreatePort, __VA_ARGS__)
#define HostCreatePortSource(...)                  OR_FAIL(nullptr, HostCreatePortSource, __VA_ARGS__)
#define HostEnableServiceTransactions(...)         OR_FAIL(-1, HostEnableServiceTransactions, __VA_ARGS__)
#define HostConnectWindowServer(...)               OR_FAIL(0, HostConnectWindowServer, __VA_ARGS__)
#define HostSetLocalEventsSuppressionInterval(...) OR_FAIL(-1, HostSetLocalEventsSuppressionInterval, __VA_ARGS__)
#define HostClearEventRecord(...)                  OR_FAIL(-1, HostClearEventRecord, __VA_ARGS__)
#define HostPostEventRecord(...)                   OR_FAIL(-1, HostPostEventRecord, __VA_ARGS__)
#define HostCreatePrivateEventSource(...)          OR_FAIL(nullptr, HostCreatePrivateEventSource, __VA_ARGS__)
#define HostCreateKeyboardEvent(...)               OR_FAIL(nullptr, HostCreateKeyboardEvent, __VA_ARGS__)
#define HostFindProcessByBundleIdentifier(...)     OR_FAIL(-1, HostFindProcessByBundleIdentifier, __VA_ARGS__)
#define HostGetActiveDisplayList(...)              OR_FAIL(-1, HostGetActiveDisplayList, __VA_ARGS__)
#define HostGetApplicationListSeed(...)            OR_FAIL(0, HostGetApplicationListSeed, __VA_ARGS__)
#define HostFindRunningApplications(...)           OR_FAIL(nullptr, HostFindRunningApplications, __VA_ARGS__)
#define HostCopyApplicationSerialNumber(...)       OR_FAIL(nullptr, HostCopyApplicationSerialNumber, __VA_ARGS__)
#define HostCopyApplicationInformation(...)        OR_FAIL(nullptr, HostCopyApplicationInformation, __VA_ARGS__)
#define HostCopyApplicationInformationItem(...)    OR_FAIL(nullptr, HostCopyApplicationInformationItem, __VA_ARGS__)
#define HostCopyFrontApplication(...)              OR_FAIL(nullptr, HostCopyFrontApplication, __VA_ARGS__)
#define HostExtractSerialNumberParts(...)          OR_FAIL(0, HostExtractSerialNumberParts, __VA_ARGS__)
#define HostCreateScript(...)                      OR_FAIL(nullptr, HostCreateScript, __VA_ARGS__)
#define HostExecuteScript(...)                     OR_FAIL(nullptr, HostExecuteScript, __VA_ARGS__)
#define HostDescriptorInt32Value(...)              OR_FAIL(0, HostDescriptorInt32Value, __VA_ARGS__)
#define HostDescriptorTypeCodeValue(...)           OR_FAIL(0, HostDescriptorTypeCodeValue, __VA_ARGS__)
#define HostCreateDescriptor(...)                  OR_FAIL(-1, HostCreateDescriptor, __VA_ARGS__)
#define HostCreateEvent(...)                       OR_FAIL(-1, HostCreateEvent, __VA_ARGS__)
#define HostDisposeDescriptor(...)                 OR_FAIL(-1, HostDisposeDescriptor, __VA_ARGS__)
// clang-format on

#define HostPostEventToProcess(process, event) \
  (simulator::keyIsPosted(process), HostPostEventToProcess(process, event))
#define HostSendEvent(...) \
  (simulator::fails("HostSendEvent") ? -1 : simulator::eventIsSent(HostSendEvent(__VA_ARGS__)))
