// Words to deeds: what every word of a role's dictionary does on every program that plays the role.
#pragma once

#include <span>

#include "platform/linux/programs/table.h"
#include "platform/linux/programs/running.h"
#include "platform/tarnscript/tarnscript.h"

namespace desktop {

/// The way in which a word is carried out.
enum class Means : std::uint8_t {
  Mpris,    ///< a method of org.mpris.MediaPlayer2.Player, without arguments
  Mpv,      ///< a command for mpv's JSON channel, its words blank-separated
  Rc,       ///< a line for VLC's rc interface
  Action,   ///< a GTK action of the program's window or application ("win.presentation", "app.quit=…")
  Key,      ///< keys for the program's window ("F5", "Shift+m", "Escape F11")
  Code,     ///< written out in the role's own file; the text tells what it does
  Nothing,  ///< succeeds and does nothing, because the texts around it do the real work
};

/// One row: on this program (null: on every other program of the role) the word is done so. Several rows for
/// one word and program are tried in order; the first whose channel is there counts. A word without a row,
/// and one none of whose channels is there, fails like any script error.
struct Deed {
  Role role;
  /// The desktop entry, without ".desktop".
  const char* program;
  /// Command or property of the role's dictionary, or one of own_words.h.
  tarnscript::Code word;
  Means means;
  const char* how;
};

std::span<const Deed> deeds();

/// Carries a command out by its row; throws tarnscript::Refusal where there is none or its channels are not
/// there.
void perform(const Instance& instance, tarnscript::Code word);

}  // namespace desktop
