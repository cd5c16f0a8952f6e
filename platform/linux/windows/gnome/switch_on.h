// The extension is installed with kvd: it is meant to run, unless the person has switched it off.
#pragma once

namespace linux::windows::gnome {

/// Has the shell run the extension where it is installed and nobody has switched it on or off yet; asks the
/// shell once, and waits for nothing.
void switchOn();

/// Another shell is there, or none.
void forgetAnswer();

}  // namespace linux::windows::gnome
