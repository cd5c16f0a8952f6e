// Which display the session has.
#pragma once

namespace linux::windows::x11 {

/// Takes DISPLAY and XAUTHORITY from the service manager's environment into this process's own: a desktop
/// may tell them to the service manager after this service was started. True when one has changed.
bool takeDisplayOfSession();

}  // namespace linux::windows::x11
