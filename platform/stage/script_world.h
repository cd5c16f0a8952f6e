// The applications of the rehearsal desktop as scripts see them, and every script in the journal.
#pragma once

#include <string>

#include "platform/tarnscript/tarnscript.h"

namespace stage {

/// Gives the script operations of the host the installed applications and the journal.
void letScriptsFindApplications();

/// Runs a script of the person at the desktop, which is not the daemon's and so not journaled as one.
tarnscript::Outcome runScript(const std::string& source);

/// A script's answer in a few words; empty for no value.
std::string describe(const tarnscript::Value& value);

}  // namespace stage
