// The core's own time for a button, on a host whose operations fail at once: nothing runs, nothing is in
// front and the application list never changes.

#include <benchmark/benchmark.h>

#include "daemon/messages.h"
#include "routing/dispatcher.h"

namespace {

void dispatch(benchmark::State& state, UsageKey key) {
  const PackedHIDEvent event =
      PackHIDEvent({static_cast<std::uint16_t>(key >> 16), static_cast<std::uint16_t>(key), 0});
  for (auto _ : state) benchmark::DoNotOptimize(DispatchHIDEvent(event, 1, false));
}

/// From the bytes of a message to the end of the dispatch, the service port off the loop meanwhile.
void message(benchmark::State& state) {
  kvd_handlehidevent_request_t request{};
  request.Head.msgh_size = sizeof request;
  request.Head.msgh_id = kKVDHandleHIDEventID;
  request.NDR = NDR_record;
  request.usagePage = 0x0C;
  request.usage = 0xB7;
  request.value = 1;
  for (auto _ : state) {
    MachMessageReceivedCallback(nullptr, &request, sizeof request, nullptr);
    benchmark::ClobberMemory();
  }
}

BENCHMARK_CAPTURE(dispatch, stop, Key::Stop);  // a button that nobody takes
BENCHMARK_CAPTURE(dispatch, play_which_launches, Key::PlayPause);
BENCHMARK_CAPTURE(dispatch, volume_down, Key::VolumeDecrement);
BENCHMARK(message);

}  // namespace
