#include "platform/base/port.h"

#include <cstring>
#include <utility>

#include "platform/base/receive_queue.h"
#include "platform/base/run_loop.h"

namespace base {
namespace {

struct Port final : HostObject {
  static constexpr Kind kKind = Kind::Port;
  Port(mach_port_t portName, ReceiveQueue& receiver, std::size_t largest, HostPortCallback function,
       void* data)
      : HostObject(kKind),
        name(portName),
        queue(receiver),
        largestMessage(largest),
        callback(function),
        context(data) {}
  const mach_port_t name;
  ReceiveQueue& queue;
  const std::size_t largestMessage;
  const HostPortCallback callback;
  void* const context;
  PortCounts counts;
};

struct PortSource final : Source {
  PortSource(Port& receiver, std::int32_t rank)
      : Source(receiver.queue.socket(), rank, [&receiver] { deliverOne(receiver); }),
        port(retained(&receiver)) {
    prepare = [&receiver] { return receiver.queue.hasReadAhead(); };
  }

  static void deliverOne(Port& port);

  const Owned<Port> port;
};

std::function<void(std::span<const std::byte>, pid_t)> observe;

/// Fills in what the receiver's kernel writes: the arrival port with a send disposition, no reply port, the
/// size. Rights that a message pretends to carry stay visible as the complex bit.
void stampHeader(std::vector<std::byte>& message, mach_port_t arrival) {
  constexpr int localDispositionShift = 8;
  mach_msg_header_t header = {};
  std::memcpy(&header, message.data(), sizeof header);
  header.msgh_bits = (header.msgh_bits & MACH_MSGH_BITS_COMPLEX) | MACH_MSG_TYPE_PORT_SEND
                                                                       << localDispositionShift;
  header.msgh_size = static_cast<mach_msg_size_t>(message.size());
  header.msgh_remote_port = MACH_PORT_NULL;
  header.msgh_local_port = arrival;
  header.msgh_reserved = 0;
  std::memcpy(message.data(), &header, sizeof header);
}

void PortSource::deliverOne(Port& port) {
  auto datagram = port.queue.take();
  if (!datagram) return;
  const std::size_t size = datagram->bytes.size();
  if (!datagram->trusted || size < sizeof(mach_msg_header_t) || size > port.largestMessage) {
    ++port.counts.dropped;
    return;
  }
  stampHeader(datagram->bytes, port.name);
  ++port.counts.delivered;
  if (observe) observe(datagram->bytes, datagram->sender);
  port.callback(HostPortRef(&port), datagram->bytes.data(), size, port.context);
}

}  // namespace

void setMessageObserver(std::function<void(std::span<const std::byte>, pid_t)> observer) {
  observe = std::move(observer);
}

PortCounts portCounts(HostPortRef port) {
  const auto* counted = as<Port>(port);
  return counted != nullptr ? counted->counts : PortCounts{};
}

}  // namespace base

HostPortRef HostCreatePort(mach_port_t port, std::size_t largestMessage, HostPortCallback callback,
                           void* context) {
  base::ReceiveQueue* queue = base::receiveQueue(port);
  if (queue == nullptr || callback == nullptr) return nullptr;
  return HostPortRef(new base::Port(port, *queue, largestMessage, callback, context));
}

HostSourceRef HostCreatePortSource(HostPortRef port, std::int32_t order) {
  auto* served = base::as<base::Port>(port);
  return served != nullptr ? HostSourceRef(new base::PortSource(*served, order)) : HostSourceRef();
}
