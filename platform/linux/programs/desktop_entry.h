// What a desktop entry says of its program, as GIO reads it.
#pragma once

#include <gio/gdesktopappinfo.h>

#include <optional>
#include <string>

#include "platform/linux/programs/entry.h"

namespace linux::programs {

/// The program of an entry with this id; nothing where it plays no role, does not take the remote itself and
/// was not cast for either.
std::optional<Entry> entryIn(GDesktopAppInfo* info, const std::string& id);

}  // namespace linux::programs
