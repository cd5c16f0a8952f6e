#include <unistd.h>

#include <cstdio>
#include <exception>
#include <iostream>
#include <optional>
#include <string_view>

#include "platform/base/failure.h"
#include "platform/stage/desktop.h"
#include "platform/stage/live.h"
#include "platform/stage/transcript.h"
#include "platform/terminal/screen.h"

namespace {

constexpr char kHelp[] =
    "Usage: kvd-stage\n"
    "\n"
    "Runs kvd on the rehearsal desktop: model applications in memory, a real service port.\n"
    "\n"
    "With a terminal it runs in real time and shows the desktop; other processes reach it with kvremote.\n"
    "Without one it reads commands from standard input and writes a transcript in virtual time. Lines\n"
    "that begin with a blank are passed over, so that a transcript can be played again.\n"
    "The command 'help' lists the commands.\n"
    "\n"
    "Exit status: 0, 1 when kvd could not start or a command of a transcript was unknown or wrong, 2 for a\n"
    "bad command line.\n";

/// On a full screen where the terminal can show one, else line by line.
int playAtTerminal() {
  const std::optional<int> shown = terminal::play();
  const int status = shown ? *shown : stage::playConsole(std::cout);
  if (status != 0) {
    std::fprintf(stderr, "kvd-stage: %s\n", base::lastFailure().c_str());
  } else if (shown) {
    std::puts("kvd has ended.");
  }
  return status;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc > 1) {
    const std::string_view option = argv[1];
    if (argc == 2 && option == "--help") {
      std::fputs(kHelp, stdout);
      return 0;
    }
    if (argc == 2 && option == "--version") {
      std::puts("kvd-stage " KVD_VERSION);
      return 0;
    }
    std::fputs("Usage: kvd-stage [--help | --version]\n", stderr);
    return 2;
  }
  stage::setUpDesktop();
  const bool atTerminal = isatty(STDIN_FILENO) != 0 && isatty(STDOUT_FILENO) != 0;
  try {
    return atTerminal ? playAtTerminal() : stage::playTranscript(STDIN_FILENO, std::cout);
  } catch (const std::exception& error) {
    std::fprintf(stderr, "kvd-stage: %s\n", error.what());
    return 1;
  }
}
