// What the screen knows beyond the desktop: what is being typed, held and looked at.
#pragma once

#include <optional>
#include <string>

#include "platform/screen/journal_view.h"
#include "platform/screen/lessons.h"
#include "platform/screen/remote_keys.h"

namespace live {

struct State {
  JournalView journal;
  Lessons lessons;
  /// The command being typed, without its colon.
  std::optional<std::wstring> commandLine;
  std::wstring lastCommand;
  /// The next digit closes an application.
  bool closing = false;
  bool showsHelp = false;
  /// How many rows the journal, or the help, is scrolled.
  int scrolled = 0;
  /// How many rows a page has, as drawn last.
  int page = 0;
  const RemoteKey* held = nullptr;
};

}  // namespace live
