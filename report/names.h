// Programs, roles and keys as people read them.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "daemon/kvd.h"
#include "platform/linux/programs/running.h"

namespace report {

/// What the program is called: by the table of programs, else by its desktop entry or its name on the bus.
std::string nameOf(const linux::programs::Instance& instance);

/// "music player"; "" for None.
std::string_view wordsFor(linux::programs::Role role);

/// The role that the core knows by this code; None for the codes that stand for none.
linux::programs::Role roleOf(AppCode code);

/// "Space", "Shift+S".
std::string keyName(std::uint16_t virtualKey, bool withShift);

}  // namespace report
