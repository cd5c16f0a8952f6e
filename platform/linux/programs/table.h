// The programs known to play a role: a row a program, with everything in it that is peculiar to it.
#pragma once

#include <array>
#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include "platform/linux/players/program_channel.h"
#include "platform/linux/players/quirks.h"
#include "platform/linux/programs/role.h"
#include "platform/tarnscript/tarnscript.h"

namespace linux::programs {

/// The way in which an action is carried out.
enum class Means : std::uint8_t {
  Mpris,    ///< a method of org.mpris.MediaPlayer2.Player, without arguments
  Channel,  ///< a command for the program's channel
  Action,   ///< a GTK action of its window or application ("win.presentation", "app.quit=true")
  Method,  ///< a method of its own on the bus: name, path, interface, member and at most one text; '%' in the
           ///< name is its pid, and alone its connection
  Key,     ///< keys for its window ("F5", "Shift+m", "Escape F11")
  Nothing,  ///< succeeds and does nothing, because the texts around it do the real work
};

/// What is done for a word: a command or property of the role's dictionary, or one of own_words.h.
struct Action {
  tarnscript::Code word = 0;
  Means means = Means::Nothing;
  const char* how = "";
};

/// How it is seen that a program shows slides or photos.
enum class ShowStyle : std::uint8_t {
  FullScreen,      ///< its window is full screen, by neither win.fullscreen nor a player's Stopped
  OwnWindow,       ///< a full-screen window stands beside the document's, or a window has the show's action
  ActionState,     ///< the state of a GTK action tells, and where it cannot be asked, the full screen
  ActionDisabled,  ///< the same, by a GTK action that is disabled meanwhile
};

/// A well-known program. Empty texts are what it does not have.
struct Program {
  Role role = Role::None;
  /// It reads a remote's keys itself: they are left to it while it is in front, and it plays no role.
  bool takesRemote = false;
  const char* name = "";
  /// Its desktop entry, without ".desktop".
  const char* entry = "";
  /// What follows "org.mpris.MediaPlayer2." in its bus name, without the part for further instances.
  const char* busName = "";
  /// The class of its windows (the second part of WM_CLASS), in any case.
  const char* windowClass = "";
  players::Quirks quirks = players::kNoQuirk;
  players::ChannelKind channel = players::ChannelKind::None;
  /// The name of the file that it runs: who opens the channel, takes the remote, or has windows on the bus.
  const char* executable = "";
  /// Below which path its windows are on the bus ("/org/gnome/eog/window": 1, 2).
  const char* windowsAt = "";
  ShowStyle show = ShowStyle::FullScreen;
  /// The action that tells, where one does.
  const char* showAction = "";
  /// Where one process shows the documents of several programs: how the classes of all their windows begin,
  /// which change with the document.
  const char* suite = "";
  /// Several for one word are tried in order; the first whose way is open counts.
  std::array<Action, 18> actions{};
};

std::span<const Program> programs();

/// The program with this desktop entry, bus name, window class; null when none has it. Compared without
/// regard to case.
const Program* programByEntry(std::string_view entry);
const Program* programByBusName(std::string_view busName);
const Program* programByWindowClass(std::string_view windowClass);

/// The program with windows on the bus that this executable runs; null when there is none.
const Program* programByExecutable(std::string_view executable);

/// Whether windows of this class change it with the document in them.
bool isOfSuite(std::string_view windowClass);

/// Whether what owns this bus name plays no role whatever its entry says: proxies that speak for other
/// players, headsets.
bool isBystander(std::string_view busName);

/// What every program of the role does that has no action of its own for the word.
std::span<const Action> commonActions(Role role);

/// Whether the program, which may be null, has an action of its own for the word.
bool hasOwnAction(const Program* program, tarnscript::Code word);

/// The actions for a word in the order in which they are tried: the program's own, else the role's common
/// ones.
std::vector<Action> actionsFor(Role role, const Program* program, tarnscript::Code word);

}  // namespace linux::programs
