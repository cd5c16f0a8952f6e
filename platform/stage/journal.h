// The journal: every observable thing that happens on the rehearsal desktop, in order.
#pragma once

#include <functional>
#include <string>

#include "platform/stage/clock.h"

namespace stage {

class Application;

enum class Entry {
  Question,      ///< something the daemon asked
  Script,        ///< a script, with what it answered
  Failure,       ///< why a script failed, where other things happened in between
  Event,         ///< an inter-application event
  Key,           ///< a key posted to a process
  SoundKey,      ///< a sound key posted to the window server
  Notification,  ///< a distributed notification
  Change,        ///< something changed in an application or on the desktop
  Timer,         ///< a timer started or stopped
  Service,       ///< a setting of the window server or the service manager
  Exit,          ///< the daemon ended
  Remark,        ///< what a command answers the person at the desktop
  Error,         ///< what is wrong with a command
};

/// What a question of the daemon was about.
enum class Question { Other, WhoIsInFront, WhoRuns };

struct JournalLine {
  Entry kind;
  std::string text;
  Nanoseconds time;
  /// Of a script: its whole source, and what it answered or why it failed.
  std::string source;
  std::string outcome;
  Question question = Question::Other;
  /// The application that a question's answer names, if one does.
  const Application* about = nullptr;
};

/// Writes one line.
void record(Entry kind, std::string text);
/// Writes a question, with the application that the answer names.
void recordQuestion(Question question, std::string text, const Application* about);

/// Writes that a script runs, shortened for people: to whom, and what.
void recordScriptStart(const std::string& source);
/// Writes that it ended: behind its own line where nothing else happened in between. An answer that comes
/// behind changes is left out, for the changes tell it; a failure is not.
void recordScriptEnd(const std::string& answer);
void recordScriptFailure(const std::string& message, int line);

/// Where the lines go, one listener at a time.
void setJournalListener(std::function<void(const JournalLine& line)> listener);

}  // namespace stage
