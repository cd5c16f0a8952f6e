#include <cstdio>
#include <string_view>

#include "daemon/lifecycle.h"
#include "platform/base/failure.h"
#include "platform/base/run_loop.h"
#include "platform/linux/host/host.h"
#include "platform/linux/windows/every_backend.h"

namespace {

constexpr char kHelp[] =
    "Usage: kvd\n"
    "\n"
    "Turns the buttons of a media remote, which kvremote or a receiver sends it, into actions of media\n"
    "players. It runs until 'kvremote quit', SIGTERM or two idle hours end it; kvd(8) tells more.\n"
    "\n"
    "  --help     show this help\n"
    "  --version  show the version\n"
    "\n"
    "Exit status: 0, 1 when it could not start, 2 for a bad command line.\n";

/// The exit status of a command line that asks for something else than the daemon.
int answer(std::string_view argument) {
  if (argument == "--help") {
    std::fputs(kHelp, stdout);
    return 0;
  }
  if (argument == "--version") {
    std::puts("kvd " KVD_VERSION);
    return 0;
  }
  std::fputs("Usage: kvd [--help | --version]\n", stderr);
  return 2;
}

}  // namespace

int main(int count, char** words) {
  if (count > 1) return answer(count == 2 ? words[1] : "");
  base::endLoopOnSignals();
  linux::host::init(linux::windows::everyBackend());
  const int status = KVDMain();
  if (status != 0) std::fprintf(stderr, "kvd: %s\n", base::lastFailure().c_str());
  linux::host::finish();
  return status;
}
