#include "platform/stage/recording.h"

#include <string_view>
#include <utility>

#include "platform/stage/quantities.h"

namespace stage {

namespace {

constexpr Nanoseconds kMillisecond = 1'000'000;

/// A shorter wait is the time that the machine took, not the person; it is made up for by a later one.
constexpr Nanoseconds kShortestWait = 5 * kMillisecond;

/// Cut, not rounded: nothing that was due after a command may come before it.
Nanoseconds cut(Nanoseconds time) { return time / kMillisecond * kMillisecond; }

constexpr std::string_view kPress = "press ";
constexpr std::string_view kRelease = "release ";

}  // namespace

bool Recording::isHold(const Done& first, const Done& second) {
  return first.command.starts_with(kPress) && second.command.starts_with(kRelease) &&
         first.command.substr(kPress.size()) == second.command.substr(kRelease.size()) &&
         second.moment.time - first.moment.time >= kShortestWait;
}

void Recording::add(std::string command, Moment moment) { done_.push_back({std::move(command), moment}); }

std::string Recording::commands(Moment end) const {
  std::string text = "start\n";
  Nanoseconds written = 0;
  const auto waitUntil = [&](Nanoseconds time) {
    if (cut(time) - written < kShortestWait) return;
    text += "wait " + timeText(cut(time) - written) + "\n";
    written = cut(time);
  };
  for (auto done = done_.begin(); done != done_.end(); ++done) {
    waitUntil(done->moment.time);
    const auto next = done + 1;
    if (next == done_.end() || !isHold(*done, *next)) {
      text += done->command + "\n";
      continue;
    }
    // A hold counts from the message on, a wait from when the daemon has dealt with it.
    const Nanoseconds dealing = next->moment.slept - done->moment.slept;
    const Nanoseconds held = cut(next->moment.time) - written + cut(dealing);
    text += "hold " + done->command.substr(kPress.size()) + " " + timeText(held) + "\n";
    written = cut(next->moment.time);
    done = next;
  }
  waitUntil(end.time);
  return text;
}

}  // namespace stage
