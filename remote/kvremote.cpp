// kvremote: the buttons of a media remote from the command line.

#include <cstdio>
#include <exception>
#include <span>

#include "remote/arguments.h"
#include "remote/buttons.h"
#include "remote/deliver.h"
#include "remote/session.h"

namespace {

constexpr char kHelp[] = R"(Usage: kvremote BUTTON [--press | --release | --hold TIME]
       kvremote --raw PAGE USAGE VALUE [EXTRA]
       kvremote lock on|off
       kvremote quit
       kvremote list

Send a button of a media remote to kvd, which acts on it.

  BUTTON            tap the button: play, next, volume-up, ... or its HID usage name
                    (scan-next-track); only buttons that people hold send a release
  --press           send the press alone
  --release         send the release alone
  --hold TIME       press, wait, release; 2s, 500ms, 1.5s or 1m, at most 10m
  --raw             send numbers as they are, decimal or 0x...
  lock on|off       say that the screen was locked or unlocked
  quit              ask kvd to quit
  list              list the buttons
  --user NAME       send to the kvd of another user, which takes root; root without
                    XDG_RUNTIME_DIR sends to the user at the screen anyway
  -h, --help        show this help
  --version         show the version

Exit status:
  0  sent
  1  not sent: nobody is listening, or another error
  2  bad command line or unknown button
  3  not sent: the queue stayed full for 5 seconds

Ctrl-C during --hold releases the button first.
)";

void listButtons() {
  std::printf("%-12s  PAGE  USAGE  HID NAME\n", "NAME");
  for (const remote::Button& button : remote::buttons()) {
    std::printf("%-12s  0x%02X  0x%02X   %s\n", button.name.data(), button.usagePage, button.usage,
                button.hidName.data());
  }
}

int run(const remote::Arguments& arguments) {
  switch (arguments.action) {
    case remote::Action::ShowHelp:
      std::fputs(kHelp, stdout);
      break;
    case remote::Action::ShowVersion:
      std::puts("kvremote " KVD_VERSION);
      break;
    case remote::Action::ListButtons:
      listButtons();
      break;
    default:
      remote::chooseSession(arguments.user);
      return remote::deliver(arguments);
  }
  if (std::fflush(stdout) == 0 && std::ferror(stdout) == 0) return 0;
  std::perror("kvremote: standard output");
  return remote::kNotSent;
}

}  // namespace

int main(int count, char** words) {
  try {
    const std::span<const char* const> all(words, static_cast<std::size_t>(count));
    return run(remote::parseArguments(all.subspan(all.empty() ? 0 : 1)));
  } catch (const remote::UsageError& error) {
    std::fprintf(stderr, "kvremote: %s\n", error.what());
    return remote::kUsageError;
  } catch (const std::exception& error) {
    std::fprintf(stderr, "kvremote: %s\n", error.what());
    return remote::kNotSent;
  }
}
