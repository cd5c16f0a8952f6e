// kvd-receiver: the buttons of infrared, HDMI-CEC, Bluetooth and USB remotes, for kvd.

#include <cstdio>
#include <exception>
#include <span>

#include "receiver/arguments.h"
#include "receiver/list.h"
#include "receiver/receiver.h"
#include "remote/words.h"

namespace {

constexpr char kHelp[] = R"(Usage: kvd-receiver [--device DEVICE]... [--no-grab] [--list | --monitor]

Reads the remotes that are plugged in or paired and sends their buttons to kvd.

  --list                 list the devices: which are remotes, and why or why not
  --monitor              show each button as it comes, and what is sent
  --device DEVICE        take a device for a remote: /dev/input/event5, or its name;
                         may be given more than once
  --no-grab              leave the remotes' keys to the desktop too, which may act
                         on them a second time
  --pass-through SOCKET  where the helper listens that hands keys on which kvd has no
                         use for (/run/kvd/pass-through)
  -h, --help             show this help
  --version              show the version

Exit status: 0 after a signal or a listing, 1 when it could not start, 2 for a bad
command line.
)";

int act(const receiver::Arguments& arguments) {
  switch (arguments.action) {
    case receiver::Action::ShowHelp:
      std::fputs(kHelp, stdout);
      return 0;
    case receiver::Action::ShowVersion:
      std::puts("kvd-receiver " KVD_VERSION);
      return 0;
    case receiver::Action::List:
      return receiver::list(arguments);
    default:
      return receiver::run(arguments);
  }
}

}  // namespace

int main(int count, char** words) {
  try {
    const std::span<const char* const> all(words, static_cast<std::size_t>(count));
    return act(receiver::parseArguments(all.subspan(all.empty() ? 0 : 1)));
  } catch (const remote::UsageError& error) {
    std::fprintf(stderr, "kvd-receiver: %s\n", error.what());
    return 2;
  } catch (const std::exception& error) {
    std::fprintf(stderr, "kvd-receiver: %s\n", error.what());
    return 1;
  }
}
