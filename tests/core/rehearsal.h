// The core on the rehearsal desktop, seen from a test.
//
// The daemon's state has no reset, so each rehearsal runs in a child process of its own and hands back what
// was written.
#pragma once

#include <functional>
#include <string>

#include "daemon/kvd.h"

/// What `play` returns, from a child process with a fresh desktop in virtual time. A child that dies is told
/// in the text.
std::string inChild(const std::function<std::string()>& play);

/// The transcript of these commands, one a line.
std::string transcriptOf(const std::string& commands);

/// Performs commands of the desktop, separated by "; ", without a daemon, and ends the child where one
/// is refused; for use inside a child.
void set(const std::string& commands);

/// The journal's lines since the last call, each ended by a line break; for use inside a child.
std::string journal();

/// What went out since the last call, scripts in full, events, keys and sound keys, each with "; " behind it;
/// for use inside a child.
std::string sent();

/// A four-character code as text.
std::string codeText(FourCharCode code);

/// A packed button event of these keys.
constexpr PackedHIDEvent eventOf(UsageKey key) { return key >> 16 | (key & 0xFFFF) << 16; }
