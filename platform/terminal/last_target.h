// Where the last button went and why, told from what the daemon asked on its way.
#pragma once

#include <cstdint>
#include <map>
#include <string>

#include "daemon/kvd.h"
#include "platform/stage/journal.h"

namespace terminal {

/// The daemon keeps its choice, not the reason; but it asks who is in front once for each choice, and about
/// the application that it will choose once or twice more: whether it runs, to hear whether it plays, and
/// again when nothing plays.
class LastTarget {
 public:
  /// A line of the journal.
  void note(const stage::JournalLine& line);
  /// Between two buttons: takes down how the last one ended.
  void settle();
  /// In one line, for people.
  const std::wstring& text() const { return text_; }

 private:
  enum class Reason { InFront, Plays, ChosenLast, RunsFirst };

  Reason reasonFor(const stage::Application* target) const;
  void conclude(AppCode target);

  bool choosing_ = false;
  bool soundKey_ = false;
  std::uint64_t turn_ = 0;  ///< of the run loop, when the choice began
  const stage::Application* front_ = nullptr;
  /// How often the daemon asked whether they run, since the choice began.
  std::map<const stage::Application*, int> asked_;
  /// The last target that was in front or played; null since a choice fell back on the first that runs.
  const stage::Application* remembered_ = nullptr;
  std::wstring text_ = L"none yet";
};

}  // namespace terminal
