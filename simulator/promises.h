// What the daemon promises whatever happens, checked while it runs.
//
// What goes out is judged as it goes out, by the journal; the rest when an event has been dispatched and when
// the daemon has nothing left to do. Nothing here asks the daemon how it decides: the promises are worked out
// from the desktop and the messages.
#pragma once

#include <optional>
#include <string>

#include "platform/stage/journal.h"

namespace simulator {

/// Judges what the daemon does; for stage::beginRehearsal.
void watchJournal(const stage::JournalLine& line);
/// Looks at every message before the daemon gets it.
void watchMessages();
/// To be called when nothing is ready and nothing is due.
void checkAtRest();
/// To be called when the daemon has ended, with its exit status.
void checkAtEnd(int status);
/// Whether the daemon takes messages now.
bool daemonListens();

/// Whether the desktop is true to what it says: not where a host operation fails, which may well send a
/// button elsewhere.
void expectTrueDesktop(bool expected);

/// Expects that an application plays now.
void expectPlaying(const std::string& name);

/// The first promise that was broken, in one line.
std::optional<std::string> brokenPromise();

}  // namespace simulator
