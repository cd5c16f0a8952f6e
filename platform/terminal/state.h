// What the screen knows beyond the desktop: what is being typed, held and looked at.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "platform/terminal/journal_view.h"
#include "platform/terminal/keys.h"
#include "platform/terminal/last_target.h"
#include "platform/terminal/lessons.h"

namespace terminal {

/// What the next digit does instead of opening an application.
enum class Pending { Nothing, Close, Fail };

struct State {
  JournalView journal;
  LastTarget target;
  Lessons lessons;
  /// The command being typed, without its colon.
  std::optional<std::wstring> commandLine;
  /// The commands typed so far, and which of them is being looked at; all of them when none is.
  std::vector<std::wstring> history;
  std::size_t recalled = 0;
  Pending pending = Pending::Nothing;
  bool showsHelp = false;
  bool wholeScripts = false;
  /// How many rows the journal, or the help, is scrolled.
  int scrolled = 0;
  /// How many rows a page has, as drawn last.
  int page = 0;
  const RemoteKey* held = nullptr;
};

}  // namespace terminal
