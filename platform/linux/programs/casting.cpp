#include "platform/linux/programs/casting.h"

#include "platform/linux/programs/entries.h"
#include "platform/text/case.h"

namespace linux::programs {

namespace {

/// `known` is how the program was found in the table.
Casting decide(const Entry* entry, const Program* program, Ground known, bool bystander) {
  Casting casting;
  casting.program = program;
  if (entry != nullptr) {
    casting.entry = entry->id;
  } else if (program != nullptr) {
    casting.entry = program->entry;
  }
  casting.byEntry = entry != nullptr && entry->cast;
  casting.takesRemote = casting.byEntry ? entry->takesRemote : program != nullptr && program->takesRemote;
  if (bystander && !casting.byEntry) {
    casting.ground = Ground::Bystander;
    return casting;
  }
  if (program != nullptr && !casting.byEntry) {
    casting.role = program->role;
    casting.ground = known;
  } else if (entry != nullptr) {
    casting.role = entry->role;
    casting.ground = casting.byEntry ? Ground::OwnWord : Ground::Categories;
  }
  // What its row says is written for a program in its own role.
  if (casting.program != nullptr && casting.program->role != casting.role) casting.program = nullptr;
  return casting;
}

}  // namespace

Casting castPlayer(std::string_view desktopEntry, std::string_view busName) {
  const Entry* entry = entryByID(desktopEntry);
  const Program* program = programByBusName(busName);
  const Ground known = program != nullptr ? Ground::BusName : Ground::DesktopEntry;
  if (program == nullptr) program = programByEntry(desktopEntry);
  if (entry == nullptr && program != nullptr) entry = entryByID(program->entry);
  return decide(entry, program, known, isBystander(busName));
}

Casting castWindow(const windows::Window& window) {
  const Entry* entry = entryByID(window.applicationID);
  const Program* program = programByEntry(window.applicationID);
  for (const std::string_view name : {window.className, window.instanceName}) {
    if (entry == nullptr) entry = entryByWindowClass(name);
    if (program == nullptr) program = programByWindowClass(name);
  }
  const Ground known = program == nullptr || text::equalIgnoringCase(program->entry, window.applicationID)
                           ? Ground::DesktopEntry
                           : Ground::WindowClass;
  if (program == nullptr && entry != nullptr) program = programByEntry(entry->id);
  if (entry == nullptr && program != nullptr) entry = entryByID(program->entry);
  const bool browser = program != nullptr && (program->quirks & players::kNeedsMedia) != 0;
  return decide(entry, program, known, browser);
}

}  // namespace linux::programs
