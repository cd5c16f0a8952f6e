// Lets one call of kvd's desktop fail: over the session bus, over a program's channel, or to the window
// system.
//
// Linked into a rehearsal on the fake session, in front of the functions by which kvd calls
// (see CMakeLists.txt). KVD_FAILING_CALL=NUMBER:HOW says which call, and how: "error", "silence" (no answer
// ever comes) or "rubbish" (an answer of another kind). "0:count" lets none fail. How many calls there were
// stands in the last line of standard error.

#include <sys/socket.h>
#include <systemd/sd-bus.h>

#include <algorithm>
#include <cerrno>
#include <cstdarg>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <string_view>

#include "platform/stage/clock.h"
#include "tests/linux/fake_windows.h"

// The names that the linker gives to the functions themselves and to what stands before them.
// NOLINTBEGIN(bugprone-reserved-identifier)
extern "C" {
int __real_sd_bus_call(sd_bus* bus, sd_bus_message* message, std::uint64_t timeout, sd_bus_error* error,
                       sd_bus_message** reply);
int __real_sd_bus_call_async(sd_bus* bus, sd_bus_slot** slot, sd_bus_message* message,
                             sd_bus_message_handler_t callback, void* context, std::uint64_t timeout);
int __real_sd_bus_send(sd_bus* bus, sd_bus_message* message, std::uint64_t* cookie);
ssize_t __real_send(int socket, const void* bytes, std::size_t size, int flags);
ssize_t __real_recv(int socket, void* bytes, std::size_t size, int flags);
}

namespace {

enum class Fate { Reached, Error, Silence, Rubbish };

struct Plan {
  std::uint64_t number = 0;
  Fate fate = Fate::Reached;
  std::uint64_t calls = 0;

  Plan() {
    const char* const text = std::getenv("KVD_FAILING_CALL");
    if (text == nullptr) return;
    char* how = nullptr;
    number = std::strtoull(text, &how, 10);
    const std::string_view word(how);
    fate = word == ":error" ? Fate::Error : word == ":silence" ? Fate::Silence : Fate::Rubbish;
  }
  Plan(const Plan&) = delete;
  Plan& operator=(const Plan&) = delete;
  ~Plan() { std::fprintf(stderr, "%llu calls\n", static_cast<unsigned long long>(calls)); }
};

/// Stories are over by then; what comes behind them meets no failure.
constexpr stage::Nanoseconds kAllIsWell = stage::kVirtualStart + 3600 * stage::kSecond;

Fate nextCall() {
  static Plan plan;
  if (stage::now() >= kAllIsWell) return Fate::Reached;
  return ++plan.calls == plan.number ? plan.fate : Fate::Reached;
}

/// A name on the bus that never answers.
const char* silentName() {
  static sd_bus* silent = nullptr;
  static const char* const name = [] {
    const char* unique = nullptr;
    if (sd_bus_open_user(&silent) < 0 || sd_bus_get_unique_name(silent, &unique) < 0) std::abort();
    return unique;
  }();
  return name;
}

/// The call in whose place the one that fails is made.
sd_bus_message* substitute(sd_bus* bus, Fate fate) {
  sd_bus_message* message = nullptr;
  const char* const receiver = fate == Fate::Silence ? silentName() : "org.freedesktop.DBus";
  const char* const member = fate == Fate::Rubbish ? "ListNames" : "NoSuchMethod";
  if (sd_bus_message_new_method_call(bus, &message, receiver, "/org/freedesktop/DBus", "org.freedesktop.DBus",
                                     member) < 0) {
    std::abort();
  }
  return message;
}

int callSubstitute(sd_bus* bus, sd_bus_slot** slot, Fate fate, sd_bus_message_handler_t callback,
                   void* context) {
  sd_bus_message* const message = substitute(bus, fate);
  const int result = __real_sd_bus_call_async(bus, slot, message, callback, context, 0);
  sd_bus_message_unref(message);
  return result;
}

}  // namespace

extern "C" {

int __wrap_sd_bus_call(sd_bus* bus, sd_bus_message* message, std::uint64_t timeout, sd_bus_error* error,
                       sd_bus_message** reply) {
  const Fate fate = nextCall();
  if (fate == Fate::Reached) return __real_sd_bus_call(bus, message, timeout, error, reply);
  if (fate == Fate::Silence) return -ETIMEDOUT;
  sd_bus_message* const other = substitute(bus, fate);
  const int result = __real_sd_bus_call(bus, other, timeout, error, reply);
  sd_bus_message_unref(other);
  return result;
}

int __wrap_sd_bus_call_async(sd_bus* bus, sd_bus_slot** slot, sd_bus_message* message,
                             sd_bus_message_handler_t callback, void* context, std::uint64_t timeout) {
  const Fate fate = nextCall();
  if (fate != Fate::Reached) return callSubstitute(bus, slot, fate, callback, context);
  return __real_sd_bus_call_async(bus, slot, message, callback, context, timeout);
}

int __wrap_sd_bus_call_method_async(sd_bus* bus, sd_bus_slot** slot, const char* destination,
                                    const char* path, const char* interface, const char* member,
                                    sd_bus_message_handler_t callback, void* context, const char* types,
                                    ...) {
  const Fate fate = nextCall();
  if (fate != Fate::Reached) return callSubstitute(bus, slot, fate, callback, context);
  va_list arguments;
  va_start(arguments, types);
  const int result = sd_bus_call_method_asyncv(bus, slot, destination, path, interface, member, callback,
                                               context, types, arguments);
  va_end(arguments);
  return result;
}

int __wrap_sd_bus_send(sd_bus* bus, sd_bus_message* message, std::uint64_t* cookie) {
  // The fake session wants to know the number of what it sends; kvd never does.
  if (cookie != nullptr) return __real_sd_bus_send(bus, message, cookie);
  const Fate fate = nextCall();
  if (fate == Fate::Reached) return __real_sd_bus_send(bus, message, cookie);
  return fate == Fate::Error ? -ENOTCONN : 1;
}

ssize_t __wrap_send(int socket, const void* bytes, std::size_t size, int flags) {
  const Fate fate = nextCall();
  if (fate == Fate::Reached) return __real_send(socket, bytes, size, flags);
  if (fate != Fate::Error) return static_cast<ssize_t>(size);
  errno = EPIPE;
  return -1;
}

ssize_t __wrap_recv(int socket, void* bytes, std::size_t size, int flags) {
  const Fate fate = nextCall();
  if (fate == Fate::Reached) return __real_recv(socket, bytes, size, flags);
  if (fate != Fate::Rubbish) return 0;
  constexpr std::string_view kRubbish = "\0{\"request_id\":\"x\",\"error\":[[]]}\n\xff\n-1\n";
  const std::size_t count = std::min(size, kRubbish.size());
  std::memcpy(bytes, kRubbish.data(), count);
  return static_cast<ssize_t>(count);
}
}
// NOLINTEND(bugprone-reserved-identifier)

namespace {

const bool sWindowsFail = [] {
  fake::screen().callFails = [] { return nextCall() != Fate::Reached; };
  return true;
}();

}  // namespace
