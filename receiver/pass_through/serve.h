// One connection of the helper.
#pragma once

namespace receiver::pass_through {

/// Makes the device through uinput's node at `uinput` and presses on it what the receiver at the other end
/// asks for, until it hangs up. Packets that are no press of one of kKeys are passed over, and so are presses
/// while its user may not press. Throws std::runtime_error, or its std::system_error, where it does not serve
/// or the device fails.
void serve(int connection, const char* uinput);

}  // namespace receiver::pass_through
