// The applications that scripts can name on the real desktop.
#pragma once

namespace desktop {

/// From here on scripts find the roles of this desktop.
void letScriptsFindRoles();

}  // namespace desktop
