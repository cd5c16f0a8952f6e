// The process: start-up, the run loop, the work behind the three control messages, idle exit, the end.
#pragma once

#include <cstdint>

#include "platform/host.h"

/// Runs the daemon from start-up to its orderly end. Returns the exit status: 0 after a normal end, 1 when
/// start-up failed before anything was announced.
int KVDMain();

/// Dispatches one button event; the fields are zero-extended from 16 bits. The service port's source is off
/// the run loop meanwhile. Always 0.
kern_return_t server_handlehidevent(mach_port_t port, std::uint32_t usagePage, std::uint32_t usage,
                                    std::uint32_t extra, std::int32_t value);
/// Remembers whether the screen is locked (any non-zero byte); read at the next button. Always 0.
kern_return_t server_setscreenlocked(mach_port_t port, std::uint8_t locked);
/// Stops the run loop, which ends the daemon. Always 0.
kern_return_t server_terminate(mach_port_t port);

/// Every 600 seconds: stops the run loop when the last button is more than two hours ago, unless an
/// application that keeps the daemon is in front.
void idleKillTimerCallback(HostTimerRef timer, void* info);

/// Counts as a button for the idle rule. For other code of the process; the daemon itself does not call it.
void registerActivity();
