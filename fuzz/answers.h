// Programs that listen on sockets, as far as one can tell: whatever is asked, the same bytes come in answer.
// Stands in the place of platform/linux/system/local_socket.cpp.
#pragma once

#include <sys/types.h>

#include <string>
#include <string_view>

namespace fuzz {

/// Who listens, whoever is connected to: no process of this machine.
inline constexpr pid_t kProcess = 1 << 30;

/// What is answered from here on; borrowed.
void setAnswer(std::string_view bytes);

/// What the last connection was asked.
std::string question();

}  // namespace fuzz
