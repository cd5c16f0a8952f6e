#include "platform/base/deadline.h"

#include <gtest/gtest.h>
#include <poll.h>
#include <sys/eventfd.h>
#include <sys/time.h>

#include <csignal>

#include "platform/base/file_descriptor.h"

namespace {

using namespace std::chrono_literals;
using base::Deadline;

/// The clock stands where it is put.
class DeadlineTest : public testing::Test {
 protected:
  DeadlineTest() {
    base::setTimeSource({[this] { return now; }, {}, {}});
  }
  ~DeadlineTest() override { base::setTimeSource({}); }

  base::Nanoseconds now = 600'000'000'000;
  const base::FileDescriptor counter{eventfd(0, EFD_CLOEXEC | EFD_NONBLOCK)};
};

TEST_F(DeadlineTest, TellsWhatIsLeft) {
  const struct {
    std::chrono::nanoseconds limit, gone, left;
    int milliseconds;
    bool passed;
  } cases[] = {
      {20ms, 0ms, 20ms, 20, false},
      {20ms, 5ms, 15ms, 15, false},
      {20ms, 19'999'999ns, 1ns, 1, false},
      {20ms, 20ms, 0ms, 0, true},
      {20ms, 20h, 0ms, 0, true},
      {0ms, 0ms, 0ms, 0, true},
      {-1s, 0ms, 0ms, 0, true},
      {9'000h, 0ms, 9'000h, 2147483647, false},
  };
  for (const auto& c : cases) {
    const Deadline deadline(c.limit);
    now += c.gone.count();
    EXPECT_EQ(deadline.left(), c.left) << c.limit.count();
    EXPECT_EQ(deadline.milliseconds(), c.milliseconds) << c.limit.count();
    EXPECT_EQ(deadline.hasPassed(), c.passed) << c.limit.count();
  }
}

TEST_F(DeadlineTest, AWaitEndsWithTheEventOrTheTime) {
  EXPECT_FALSE(base::waitFor(counter.get(), POLLIN, Deadline(1ms))) << "the clock stands, the time is up";
  ASSERT_EQ(eventfd_write(counter.get(), 1), 0);
  EXPECT_TRUE(base::waitFor(counter.get(), POLLIN, Deadline(1h)));
  EXPECT_FALSE(base::waitFor(counter.get(), POLLIN, Deadline(0s))) << "ready, but too late";
}

int sCounter = -1;
volatile std::sig_atomic_t sSignals = 0;

TEST_F(DeadlineTest, SignalsDoNotEndAWait) {
  sCounter = counter.get();
  struct sigaction act {};
  act.sa_handler = [](int) {
    sSignals = sSignals + 1;
    if (sSignals == 3) eventfd_write(sCounter, 1);
  };
  struct sigaction before {};
  sigaction(SIGALRM, &act, &before);
  const itimerval every{.it_interval = {0, 1000}, .it_value = {0, 1000}};
  setitimer(ITIMER_REAL, &every, nullptr);
  const bool ready = base::waitFor(counter.get(), POLLIN, Deadline(1h));
  const itimerval never{};
  setitimer(ITIMER_REAL, &never, nullptr);
  sigaction(SIGALRM, &before, nullptr);
  EXPECT_TRUE(ready);
  EXPECT_GE(sSignals, 3);
}

}  // namespace
