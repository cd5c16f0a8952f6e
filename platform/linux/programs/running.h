// The programs that run and play a role: owners of MPRIS2 names, of windows, and of windows that
// the bus alone tells of, merged.
//
// What the bus knows and what the window systems know of one program meet by its process; where that is
// hidden, by its desktop entry.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/host.h"
#include "platform/linux/players/players.h"
#include "platform/linux/programs/casting.h"
#include "platform/linux/programs/table.h"
#include "platform/linux/windows/windows.h"

namespace linux::programs {

/// One running program that plays a role.
struct Instance {
  Role role = Role::None;
  /// Null for a program that is not in the table: it was cast by its desktop entry.
  const Program* program = nullptr;
  Ground ground = Ground::Unknown;
  /// Its desktop entry without ".desktop"; empty where it is unknown.
  std::string entry;
  pid_t process = 0;
  /// The high word is when the process started, which tells apart those that had the same number; the low
  /// word is the process id.
  HostProcessSerialNumber serialNumber;
  /// Its player on the bus, by unique name; empty when it has none.
  std::string owner;
  /// Its connection that has its windows, by unique name; empty when it has none.
  std::string connection;
  /// Its windows, topmost first.
  std::vector<windows::ID> windows;
  /// When it was last told to do something, as players::nextUse counts; 0 for never.
  std::uint64_t lastSpokenTo = 0;
};

/// Takes in what the bus and the window systems have sent, and brings the list up to date.
void takeInDesktop();

/// Changes whenever the list does.
std::uint32_t applicationListSeed();

/// In no particular order. Valid until takeInDesktop, as all that follow.
const std::vector<Instance>& instances();

/// Whether any program plays the role now.
bool isPlayed(Role role);
/// The instances of a role in the order that a person expects: the one in front, then those that play, then
/// the others, in each group by when they last played or were spoken to, else by when they were started, the
/// latest first. May ask players what they do.
std::vector<const Instance*> rankedInstances(Role role);
/// The first of them, and it stays so until the turn of the run loop ends, so that a button reaches whom it
/// was chosen for; null when none runs.
const Instance* firstInstance(Role role);
/// Notes that it has been told to do something.
void noteSpokenTo(const Instance& instance);
/// Null when it has gone.
const Instance* findInstance(const HostProcessSerialNumber& serialNumber);
/// The instance whose window is the active one; null when no program with a role is in front.
const Instance* frontInstance();

/// The player of an instance; null when it has none on the bus or has just left it.
players::Player* playerOf(const Instance& instance);

/// Asks for the topmost window, or the player where there is none, to come to the front.
void bringToFront(const Instance& instance);

}  // namespace linux::programs
