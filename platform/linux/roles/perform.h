// Words to deeds: carries out what the table of programs says of a word.
#pragma once

#include "platform/linux/roles/performer.h"
#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

/// Does what the program's actions for the word say, the first whose way is open. Throws tarnscript::Refusal
/// where it has none, or none whose way is open.
void perform(const Performer& performer, tarnscript::Code word);

}  // namespace linux::roles
