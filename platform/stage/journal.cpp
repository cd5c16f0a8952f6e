#include "platform/stage/journal.h"

#include <algorithm>
#include <optional>
#include <string_view>
#include <utility>

#include "platform/text/utf8.h"

namespace stage {

namespace {

std::function<void(const JournalLine&)> sListener;

/// A script's line, held back while its answer may still go behind it.
std::optional<JournalLine> sOpenScript;

void send(const JournalLine& line) {
  if (sListener) sListener(line);
}

/// What is written of a script's body, in bytes; the longest ones have a kilobyte.
constexpr std::size_t kLongestBody = 100;

/// "script to Spindle: play dvd" for the tell of one line and of several.
std::string shortened(std::string_view source) {
  std::string addressee;
  std::string_view body = source;
  const std::size_t open = source.find('"');
  const std::size_t close = source.find('"', open + 1);
  if (source.starts_with("tell application") && close != std::string_view::npos) {
    const std::string_view identifier = source.substr(open + 1, close - open - 1);
    addressee = " to " + std::string(identifier.substr(identifier.rfind('.') + 1));
    body = source.substr(close + 1);
    if (body.starts_with(" to ")) {
      body.remove_prefix(4);
    } else {
      body = body.substr(0, body.rfind('\n'));
      text::takeCharacter(body);
    }
  }
  // A doubled word means no more, and looks like a mistake.
  if (body.starts_with("get get ")) body.remove_prefix(4);
  std::string text = "script" + addressee + ": ";
  const std::size_t longest = text.size() + kLongestBody;
  for (const char c : body) {
    if (c == '\n') {
      text += " ⏎ ";
    } else {
      text += c;
    }
    // No character is cut.
    if (text.size() > longest && text::isUTF8(text)) return text + "…";
  }
  return text;
}

/// What a script's line ends in.
void setOutcome(const std::string& separator, std::string outcome) {
  sOpenScript->text += separator + outcome;
  sOpenScript->outcome = std::move(outcome);
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
  send({kind, std::move(text), now(), {}, {}});
}

void recordQuestion(Question question, std::string text, const Application* about) {
  closeScript();
  send({Entry::Question, std::move(text), now(), {}, {}, question, about});
}

void recordScriptStart(const std::string& source) {
  closeScript();
  sOpenScript = {Entry::Script, shortened(source), now(), source, {}};
}

void recordScriptEnd(const std::string& answer) {
  if (sOpenScript && !answer.empty()) setOutcome(" ", "= " + answer);
  closeScript();
}

void recordScriptFailure(const std::string& message, int line) {
  const std::string failure = "fails in line " + std::to_string(line) + ": " + message;
  if (sOpenScript) {
    setOutcome(", ", failure);
    closeScript();
  } else {
    record(Entry::Failure, "the script " + failure);
  }
}

}  // namespace stage
