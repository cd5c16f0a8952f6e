// The programs that run and play a role: owners of MPRIS2 names and clients of the X server, merged.
//
// What the bus knows and what the X server knows of one program meet by its process; where a sandbox's proxy
// hides that, by its desktop entry.
#pragma once

#include <string>
#include <vector>

#include "platform/host.h"
#include "platform/linux/players/mpris.h"
#include "platform/linux/programs/table.h"
#include "platform/linux/windows/x11/x11.h"

namespace desktop {

/// One running program that plays a role.
struct Instance {
  Role role = Role::None;
  /// Null for a program that is not in the table: it was cast by its desktop entry.
  const Program* program = nullptr;
  /// Its desktop entry without ".desktop"; empty where it is unknown.
  std::string entry;
  pid_t process = 0;
  /// The high word is when the process started, which tells apart those that had the same number; the low
  /// word is the process id.
  HostProcessSerialNumber serialNumber;
  /// Its player on the bus, by unique name; empty when it has none.
  std::string owner;
  /// Its windows, topmost first.
  std::vector<Window> windows;
};

/// Takes in what the bus and the X server have sent, and brings the list up to date.
void takeInDesktop();

/// Changes whenever the list does.
std::uint32_t applicationListSeed();

/// In no particular order. Valid until takeInDesktop, as all that follow.
const std::vector<Instance>& instances();

/// The instances of a role in the order that a person expects: the one in front, then those that play, then
/// the others, each group with the one that was started last at its head.
std::vector<const Instance*> instancesOf(Role role);
/// The first of them; null when none runs.
const Instance* firstInstance(Role role);
/// Null when it has gone.
const Instance* findInstance(const HostProcessSerialNumber& serialNumber);
/// The instance whose window is the active one; null when no program with a role is in front.
const Instance* frontInstance();

/// The player of an instance; null when it has none on the bus or has just left it.
Player* playerOf(const Instance& instance);

/// Asks the window manager, or the player where it has no window, to bring a program to the front.
void bringToFront(const Instance& instance);

}  // namespace desktop
