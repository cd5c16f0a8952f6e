// The rehearsal desktop's clock: virtual, or the machine's own.
#pragma once

#include <functional>
#include <optional>

#include "platform/base/run_loop.h"

namespace stage {

using base::kSecond;
using base::Nanoseconds;

/// Where virtual time begins: a multiple of 600 s, so that the idle check falls on round times, and not zero,
/// so that a date of zero is long past as it is on a real machine.
inline constexpr Nanoseconds kVirtualStart = 86'400 * kSecond;

/// Lets time move only when advanceTo says so.
void useVirtualTime();
bool timeIsVirtual();

Nanoseconds now();
/// The earlier of two times, either of which may never come.
std::optional<Nanoseconds> earlier(std::optional<Nanoseconds> a, std::optional<Nanoseconds> b);
/// Moves virtual time forward to `time`; never back, and not at all in real time.
void advanceTo(Nanoseconds time);
/// Lets so much time pass: at once in virtual time, by sleeping in real time; there a signal that asks the
/// program to end cuts it short.
void pass(Nanoseconds duration);

/// In real time, called as each such sleep begins and several times a second while it lasts; false cuts it
/// short.
void setSleepListener(std::function<bool()> listener);

/// How long all such sleeps were: as asked for, which is what they take in virtual time, and by the clock.
struct Slept {
  Nanoseconds asked = 0;
  Nanoseconds taken = 0;
};
Slept slept();

}  // namespace stage
