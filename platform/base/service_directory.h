// Where the sockets of this user's services lie.
#pragma once

#include <sys/un.h>

#include <optional>
#include <string>
#include <string_view>

namespace base {

/// The directory of this user's service sockets: $XDG_RUNTIME_DIR; where unset /run/user/<uid> if there; else
/// a private directory under the temporary one, made with mode 0700 when `create`. Nothing when it cannot be
/// trusted.
std::optional<std::string> serviceDirectory(bool create);

/// The address <directory>/<service>; nothing when the service has no plain file name or the path is too long
/// for a socket address.
std::optional<sockaddr_un> serviceAddress(const std::string& directory, std::string_view service);

}  // namespace base
