#include "platform/stage/journal.h"

#include <optional>
#include <utility>

namespace stage {

namespace {

std::function<void(const JournalLine&)> sListener;

/// A script's line, held back while its answer may still go behind it.
std::optional<JournalLine> sOpenScript;

void send(const JournalLine& line) {
  if (sListener) sListener(line);
}

void closeScript() {
  if (!sOpenScript) return;
  const JournalLine line = *std::exchange(sOpenScript, std::nullopt);
  send(line);
}

}  // namespace

void setJournalListener(std::function<void(const JournalLine&)> listener) { sListener = std::move(listener); }

void record(Entry kind, std::string text) {
  closeScript();
  send({kind, std::move(text), now()});
}

void recordScriptStart(const std::string& source) {
  closeScript();
  std::string text = "script: ";
  for (const char c : source) {
    if (c == '\n') {
      text += " ⏎ ";
    } else {
      text += c;
    }
  }
  sOpenScript = {Entry::Script, std::move(text), now()};
}

void recordScriptEnd(const std::string& answer) {
  if (sOpenScript) {
    if (!answer.empty()) sOpenScript->text += " = " + answer;
    closeScript();
  } else if (!answer.empty()) {
    record(Entry::Answer, "= " + answer);
  }
}

}  // namespace stage
