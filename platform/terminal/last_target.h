// Where the last button went and why, told from what the daemon asked on its way.
#pragma once

#include <cstdint>
#include <string>

#include "daemon/kvd.h"
#include "platform/stage/journal.h"
#include "platform/telling/choice.h"

namespace terminal {

class LastTarget {
 public:
  /// A line of the journal.
  void note(const stage::JournalLine& line);
  /// Between two buttons: takes down how the last one ended.
  void settle();
  /// In one line, for people.
  const std::wstring& text() const { return text_; }

 private:
  void conclude(AppCode target);

  bool choosing_ = false;
  bool soundKey_ = false;
  std::uint64_t turn_ = 0;  ///< of the run loop, when the choice began
  telling::Choice choice_;
  std::wstring text_ = L"none yet";
};

}  // namespace terminal
