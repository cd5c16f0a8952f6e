// The stubs, byte by byte on a little-endian machine.
#include "remote/kvd_client.h"

#include <gtest/gtest.h>

#include <iterator>

#include "tests/remote/fake_mach.h"

namespace {

using Bytes = std::vector<std::uint8_t>;

TEST(Client, SendsExactlyTheRequestAndReturnsTheResult) {
  const struct {
    std::uint8_t id;  // 600, 601, 602 less 0x200
    std::function<mach_msg_return_t()> call;
    Bytes body;
  } cases[] = {
      {0x58, [] { return kvd_terminate(kFakePort); }, {}},
      {0x59,
       [] { return kvd_handlehidevent(kFakePort, 0x000C, 0x01CD, 0xFFEE, -2); },
       {0xA0, 0xA1, 0xA2, 0xA3, 0xA4, 0xA5, 0xA6, 0xA7,  // NDR
        0x0C, 0x00, 0,    0,    0xCD, 0x01, 0,    0,     // page, usage
        0xEE, 0xFF, 0,    0,    0xFE, 0xFF, 0xFF, 0xFF}},
      {0x5A,
       [] { return kvd_setscreenlocked(kFakePort, 0x80); },
       {0xA0, 0xA1, 0xA2, 0xA3, 0xA4, 0xA5, 0xA6, 0xA7, 0x80, 0, 0, 0}},
  };
  for (const auto& [id, call, body] : cases) {
    for (const mach_msg_return_t result : {MACH_MSG_SUCCESS, MACH_SEND_TIMED_OUT, 0x7654321}) {
      gSent.clear();
      gSendResult = [result] { return result; };
      EXPECT_EQ(call(), result);

      Bytes expected = {19, 0, 0, 0, 0, 0, 0, 0, 0x34, 0x12, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, id, 0x02, 0, 0};
      expected.insert(expected.end(), body.begin(), body.end());
      ASSERT_EQ(gSent.size(), 1U);
      EXPECT_EQ(gSent[0].bytes, expected);
      EXPECT_EQ(gSent[0].arguments, (std::vector<std::int64_t>{17, std::ssize(expected), 0, 0, 5000, 0}));
    }
  }
}

}  // namespace
