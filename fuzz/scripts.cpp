// Scripts on the model applications: whatever a text makes of them, nothing is left open or alive, and a
// second desktop takes it as the first one did.

#include <algorithm>
#include <string>
#include <string_view>

#include "fuzz/fuzz.h"
#include "platform/base/object.h"
#include "platform/stage/desktop.h"
#include "platform/stage/journal.h"
#include "platform/text/utf8.h"

namespace {

using fuzz::require;

std::string sJournal;

void listen(const stage::JournalLine& line) { sJournal += line.text + " = " + line.outcome + "\n"; }

void run(const std::string& text) {
  const auto alive = base::aliveByKind();
  const HostReleaseScopeRef scope = HostOpenReleaseScope();
  const HostScriptRef script = HostCreateScript(HostCreateStringFromUTF8(text.c_str()));
  HostDictionaryRef error;
  const HostDescriptorRef result = HostExecuteScript(script, &error);
  require(!script || static_cast<bool>(result) != static_cast<bool>(error),
          "a result or an error, never both");
  sJournal += std::to_string(HostDescriptorInt32Value(result)) + "\n";
  HostRelease(script);
  require(base::openScopes() == 1, "a script leaves no scope open");
  HostCloseReleaseScope(scope);
  require(base::aliveByKind() == alive, "a script leaves nothing alive");
}

/// What happens on a fresh desktop on which everything runs, when the text is run and run again.
std::string play(const std::string& text) {
  stage::desktop() = stage::Desktop();
  stage::setUpDesktop();
  sJournal.clear();
  for (const auto& application : stage::desktop().installed) stage::openApplication(*application);
  for (int round = 0; round < 2; ++round) {
    run(text);
    stage::pass(90 * stage::kSecond);
    stage::advanceDesktop();
  }
  for (const auto& application : stage::desktop().installed) {
    sJournal += application->describe() + application->details() + "\n";
  }
  const int volume = stage::desktop().outputVolume;
  require(volume >= 0 && volume <= 100, "the output volume stays between its ends");
  return sJournal;
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  stage::useVirtualTime();
  stage::setJournalListener(listen);
  const std::string script(fuzz::textOf(data, size));
  const std::string journal = play(script);
  require(play(script) == journal, "the same happens on every desktop");
  require(text::isUTF8(journal), "the journal is text");
  return 0;
}
