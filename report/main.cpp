// kvd-report: what kvd sees at this moment, and what it would do with a button.

#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>
#include <cstddef>
#include <cstdio>
#include <exception>
#include <span>
#include <string>

#include "platform/linux/host/host.h"
#include "platform/linux/windows/every_backend.h"
#include "report/arguments.h"
#include "report/button.h"
#include "report/desktop.h"
#include "report/remotes.h"
#include "report/text.h"

namespace {

constexpr char kHelp[] = R"(Usage: kvd-report [--json]
       kvd-report BUTTON [--json]

Shows what kvd sees at this moment: the session, who is in front, which programs play
which role and why, what they play, outputs, sound, the service, the remotes.

  BUTTON      show who would get this button and why, who would be silenced first and
              what would be said, without doing any of it; 'kvremote list' shows them all
  --json      as an object of JSON, for programs
  -h, --help  show this help
  --version   show the version

Exit status: 0, 1 when the report could not be written, 2 for a bad command line.
)";

/// Not wider than is good to read, nor narrower than the longest labels take.
void fitTerminal() {
  winsize size{};
  if (ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) != 0 || size.ws_col == 0) return;
  report::setColumns(std::clamp<std::size_t>(size.ws_col, 60, 100));
}

std::string reportOn(const report::Arguments& arguments) {
  report::Object object;
  linux::host::init(linux::windows::everyBackend(), linux::windows::Use::Looking);
  if (arguments.button != nullptr) {
    object = report::describeButton(*arguments.button);
  } else {
    object = report::describeDesktop();
    object["remotes"] = report::describeRemotes();
  }
  linux::host::finish();
  // Titles are whatever their programs have written.
  fitTerminal();
  if (arguments.json) return object.dump(2, ' ', false, report::Object::error_handler_t::replace) + "\n";
  return arguments.button != nullptr ? report::buttonText(object) : report::desktopText(object);
}

int run(const report::Arguments& arguments) {
  switch (arguments.action) {
    case report::Action::ShowHelp:
      std::fputs(kHelp, stdout);
      break;
    case report::Action::ShowVersion:
      std::puts("kvd-report " KVD_VERSION);
      break;
    case report::Action::Report:
      std::fputs(reportOn(arguments).c_str(), stdout);
      break;
  }
  if (std::fflush(stdout) == 0 && std::ferror(stdout) == 0) return 0;
  std::perror("kvd-report: standard output");
  return 1;
}

}  // namespace

int main(int count, char** words) {
  try {
    const std::span<const char* const> all(words, static_cast<std::size_t>(count));
    return run(report::parseArguments(all.subspan(all.empty() ? 0 : 1)));
  } catch (const remote::UsageError& error) {
    std::fprintf(stderr, "kvd-report: %s\n", error.what());
    return 2;
  } catch (const std::exception& error) {
    std::fprintf(stderr, "kvd-report: %s\n", error.what());
    return 1;
  }
}
