// Requests as bytes in, calls and reply records as bytes out. The work routines here only note what they were
// given.

#include "daemon/messages.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

#include "daemon/lifecycle.h"

namespace {

std::string sCalled;

std::string note(const char* routine, std::initializer_list<std::int64_t> arguments) {
  std::string text = routine;
  for (const std::int64_t argument : arguments) text += " " + std::to_string(argument);
  return text;
}

/// The port on which every request here arrives.
constexpr std::uint8_t kPort = 0x2A;

/// A request: header fields that vary, then the bytes behind the header.
struct Request {
  std::uint32_t bits = 0x1100;
  std::uint32_t id = 601;
  std::vector<std::uint8_t> body;
  std::uint32_t remotePort = 0;
};

/// What the decoder made of a request.
struct Decoded {
  bool known = false;
  std::string called;
  std::vector<std::uint8_t> reply;
  std::vector<std::uint8_t> request;
};

Decoded decode(const Request& request) {
  alignas(8) std::uint8_t in[64] = {};
  alignas(8) std::uint8_t out[36];
  std::memset(out, 0xEE, sizeof out);
  const std::uint32_t header[] = {
      request.bits, static_cast<std::uint32_t>(24 + request.body.size()), request.remotePort, kPort, 0,
      request.id};
  std::memcpy(in, header, sizeof header);
  std::copy(request.body.begin(), request.body.end(), in + sizeof header);
  sCalled = "nothing";
  Decoded decoded;
  decoded.known =
      KVD_server(reinterpret_cast<mach_msg_header_t*>(in), reinterpret_cast<mach_msg_header_t*>(out));
  decoded.called = sCalled;
  decoded.reply.assign(out, out + sizeof out);
  decoded.request.assign(in, in + 24 + request.body.size());
  return decoded;
}

std::uint32_t wordAt(const std::vector<std::uint8_t>& bytes, std::size_t offset) {
  std::uint32_t word = 0;
  std::memcpy(&word, &bytes[offset], sizeof word);
  return word;
}

constexpr std::uint8_t kLittle = 1;
constexpr std::uint8_t kBig = 0;

std::vector<std::uint8_t> event(std::uint8_t intRep, std::vector<std::uint8_t> fields) {
  fields.insert(fields.begin(), {0, 0, 0, 0, intRep, 0, 0, 0});
  return fields;
}

}  // namespace

kern_return_t server_terminate(mach_port_t port) {
  sCalled = note("terminate", {port});
  return 0;
}
kern_return_t server_handlehidevent(mach_port_t port, std::uint32_t usagePage, std::uint32_t usage,
                                    std::uint32_t extra, std::int32_t value) {
  sCalled = note("handlehidevent", {port, usagePage, usage, extra, value});
  return 0;
}
kern_return_t server_setscreenlocked(mach_port_t port, std::uint8_t locked) {
  sCalled = note("setscreenlocked", {port, locked});
  return 0;
}

namespace {

TEST(Messages, RequestsReachTheirRoutineOrAreRefused) {
  // usagePage, usage and extra each with padding that must not matter, then the value.
  const std::vector<std::uint8_t> native = {0x0C, 0,    9, 9, 0xCD, 0,    9,    9,
                                            0xFE, 0xFF, 9, 9, 0xFF, 0xFF, 0xFF, 0xFF};
  const std::vector<std::uint8_t> foreign = {0, 0x0C, 9, 9, 0, 0xCD, 9, 9, 0xFF, 0xFE, 9, 9, 0, 0, 1, 2};
  std::vector<std::uint8_t> longer = event(kLittle, native);
  longer.push_back(0);
  const std::vector<std::uint8_t> shorter(longer.begin(), longer.begin() + 20);

  struct Row {
    const char* what;
    Request request;
    const char* called;
    kern_return_t result;
  };
  const Row rows[] = {
      {"native order", {0x1100, 601, event(kLittle, native)}, "handlehidevent 42 12 205 65534 -1", 0},
      {"foreign order", {0x1100, 601, event(kBig, foreign)}, "handlehidevent 42 12 205 65534 258", 0},
      {"49 bytes", {0x1100, 601, longer}, "nothing", MIG_BAD_ARGUMENTS},
      {"44 bytes", {0x1100, 601, shorter}, "nothing", MIG_BAD_ARGUMENTS},
      {"complex", {0x80001100, 601, event(kLittle, native)}, "nothing", MIG_BAD_ARGUMENTS},
      {"terminate", {0x1100, 600, {}}, "terminate 42", 0},
      {"terminate with a body", {0x1100, 600, {1}}, "nothing", MIG_BAD_ARGUMENTS},
      {"locked", {0x1100, 602, event(kLittle, {2, 9, 9, 9})}, "setscreenlocked 42 2", 0},
      {"unlocked, foreign", {0x1100, 602, event(kBig, {0, 9, 9, 9})}, "setscreenlocked 42 0", 0},
      {"lock too long", {0x1100, 602, event(kLittle, native)}, "nothing", MIG_BAD_ARGUMENTS},
      {"id before", {0x1100, 599, {}}, "nothing", MIG_BAD_ID},
      {"id behind", {0x1100, 603, {}}, "nothing", MIG_BAD_ID},
      {"greatest id", {0x1100, 0x7FFFFFFF, {}}, "nothing", MIG_BAD_ID},
  };
  for (const Row& row : rows) {
    SCOPED_TRACE(row.what);
    const Decoded decoded = decode(row.request);
    EXPECT_EQ(decoded.known, row.result != MIG_BAD_ID);
    EXPECT_EQ(decoded.called, row.called);
    EXPECT_EQ(static_cast<std::int32_t>(wordAt(decoded.reply, 32)), row.result);
    EXPECT_EQ(wordAt(decoded.reply, 20), row.request.id + 100);
    // The data representation is written beside an error and never else.
    const std::vector<std::uint8_t> ndr(decoded.reply.begin() + 24, decoded.reply.begin() + 32);
    EXPECT_EQ(ndr, row.result != 0 ? (std::vector<std::uint8_t>{0, 0, 0, 0, 1, 0, 0, 0})
                                   : std::vector<std::uint8_t>(8, 0xEE));
  }
}

TEST(Messages, ReplyHeaderAndSwapInPlace) {
  const Request request = {0x80001113, 601, event(kBig, {0, 1, 7, 7, 0, 2, 7, 7, 0, 3, 7, 7, 0, 0, 0, 4}),
                           0x77};
  const Decoded refused = decode(request);
  const std::uint32_t expected[] = {0x13, 36, 0x77, 0, 0xEEEEEEEE, 701};
  for (std::size_t i = 0; i < 6; ++i) EXPECT_EQ(wordAt(refused.reply, 4 * i), expected[i]) << i;
  EXPECT_EQ(refused.request[33], 1) << "a refused request stays as it came";

  Request taken = request;
  taken.bits = 0x1113;
  const std::vector<std::uint8_t> swapped = {1, 0, 7, 7, 2, 0, 7, 7, 3, 0, 7, 7, 4, 0, 0, 0};
  const Decoded decoded = decode(taken);
  EXPECT_EQ(std::vector<std::uint8_t>(decoded.request.begin() + 32, decoded.request.end()), swapped);
}

TEST(Messages, ExportedTable) {
  const mig_subsystem_t& table = server_KVD_subsystem;
  EXPECT_EQ(table.server, KVD_server);
  EXPECT_EQ(table.start, 600);
  EXPECT_EQ(table.end, 603);
  EXPECT_EQ(table.maxsize, 36U);
  struct Row {
    mig_routine_t stub;
    mig_impl_routine_t work;
    unsigned arguments;
    mach_msg_size_t size;
  };
  const Row rows[] = {
      {_Xterminate, reinterpret_cast<mig_impl_routine_t>(server_terminate), 1, 24},
      {_Xhandlehidevent, reinterpret_cast<mig_impl_routine_t>(server_handlehidevent), 5, 48},
      {_Xsetscreenlocked, reinterpret_cast<mig_impl_routine_t>(server_setscreenlocked), 2, 36},
  };
  mach_msg_header_t request{};
  for (std::size_t i = 0; i < 3; ++i) {
    request.msgh_id = 600 + static_cast<mach_msg_id_t>(i);
    EXPECT_EQ(KVD_server_routine(&request), rows[i].stub);
    EXPECT_EQ(table.routine[i].stub_routine, rows[i].stub);
    EXPECT_EQ(table.routine[i].impl_routine, rows[i].work);
    EXPECT_EQ(table.routine[i].argc, rows[i].arguments);
    EXPECT_EQ(table.routine[i].max_request, rows[i].size);
  }
  for (const mach_msg_id_t id : {599, 603, -1}) {
    request.msgh_id = id;
    EXPECT_EQ(KVD_server_routine(&request), nullptr);
  }
}

}  // namespace
