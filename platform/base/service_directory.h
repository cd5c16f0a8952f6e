// Where the sockets of this user's services lie.
#pragma once

#include <sys/un.h>

#include <optional>
#include <string>
#include <string_view>

namespace base {

/// Who wants the directory.
enum class Side { Sends, Receives };

/// The directory of this user's service sockets: $XDG_RUNTIME_DIR; where unset /run/user/<uid> if there; else
/// a private directory under the temporary one, made with mode 0700 for a receiver. Nothing, and the failure
/// noted, where others may put sockets into it, and for a receiver where there is none. Root may send into
/// another user's.
std::optional<std::string> serviceDirectory(Side side);

/// The address <directory>/<service>; nothing, and the failure noted, when the service has no plain file name
/// or the path is too long for a socket address.
std::optional<sockaddr_un> serviceAddress(const std::string& directory, std::string_view service);

}  // namespace base
