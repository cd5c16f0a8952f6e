// Decoding of messages, without what the work routines do.

#include <benchmark/benchmark.h>

#include "daemon/lifecycle.h"
#include "daemon/messages.h"

kern_return_t server_handlehidevent(mach_port_t, std::uint32_t usagePage, std::uint32_t usage,
                                    std::uint32_t extra, std::int32_t value) {
  benchmark::DoNotOptimize(usagePage + usage + extra + static_cast<std::uint32_t>(value));
  return KERN_SUCCESS;
}
kern_return_t server_setscreenlocked(mach_port_t, std::uint8_t) { return KERN_SUCCESS; }
kern_return_t server_terminate(mach_port_t) { return KERN_SUCCESS; }

namespace {

kvd_handlehidevent_request_t button() {
  kvd_handlehidevent_request_t request{};
  request.Head.msgh_size = sizeof request;
  request.Head.msgh_id = kKVDHandleHIDEventID;
  request.NDR = NDR_record;
  request.usagePage = 0x0C;
  request.usage = 0xCD;
  request.value = 1;
  return request;
}

/// The bytes are copied for each decoding, which swaps those of the other order in place.
void decode(benchmark::State& state, const kvd_handlehidevent_request_t& request) {
  for (auto _ : state) {
    kvd_handlehidevent_request_t arrived = request;
    mig_reply_error_t reply;
    benchmark::DoNotOptimize(arrived);
    benchmark::DoNotOptimize(KVD_server(&arrived.Head, &reply.Head));
    benchmark::DoNotOptimize(reply);
  }
}

void thisByteOrder(benchmark::State& state) { decode(state, button()); }

void otherByteOrder(benchmark::State& state) {
  kvd_handlehidevent_request_t request = button();
  request.NDR.int_rep ^= NDR_INT_LITTLE_ENDIAN;
  decode(state, request);
}

void wrongSize(benchmark::State& state) {
  kvd_handlehidevent_request_t request = button();
  --request.Head.msgh_size;
  decode(state, request);
}

BENCHMARK(thisByteOrder);
BENCHMARK(otherByteOrder);
BENCHMARK(wrongSize);

}  // namespace
