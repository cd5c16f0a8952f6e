// The daemon's process: how it starts, what it does while it runs, how it ends.

#include "daemon/lifecycle.h"

#include <gtest/gtest.h>
#include <stdlib.h>

#include <filesystem>

#include "platform/base/run_loop.h"
#include "platform/stage/journal.h"
#include "registry/registry.h"
#include "tests/core/rehearsal.h"

namespace {

TEST(Start, FailsBeforeAnythingIsAnnounced) {
  EXPECT_EQ(inChild([] {
              setenv("XDG_RUNTIME_DIR", "/proc/self/fdinfo", 1);
              return std::to_string(KVDMain()) + journal();
            }),
            "1")
      << "no check-in";
  EXPECT_EQ(
      transcriptOf("break window-server\ntap play\nwait 1h\n"),
      "break window-server\ntap play\n  finds no window server\n  exit status 1\n  nobody is listening\n"
      "wait 1h\n  left alive: nothing\nstatus 1\n");
}

TEST(Run, TakesThePortOffTheLoopDuringADispatchOnly) {
  const std::string marks = inChild([] {
    std::string onLoop;
    stage::setJournalListener([&](const stage::JournalLine& line) {
      const auto* source = base::as<base::Source>(gServicePortSource);
      if (line.kind != stage::Entry::Question) return;
      onLoop += source != nullptr && source->onLoop ? "+" : "-";
      if (onLoop == "-") set("open spindle");
    });
    set("open lyrabox; front lyrabox");
    std::string path = std::filesystem::temp_directory_path() / "kvd-test-XXXXXX";
    setenv("XDG_RUNTIME_DIR", mkdtemp(path.data()), 1);
    base::setTimeSource({{}, [](std::optional<base::Nanoseconds>) { set("press menu; quit"); }, {}});
    const int status = KVDMain();
    std::filesystem::remove_all(path);
    return onLoop + std::to_string(status);
  });
  EXPECT_EQ(marks, "--++---0")
      << "not yet in the first registry fill, on in the idle check, off in the dispatch, "
         "which looks again: somebody came during the first fill";
}

}  // namespace
