// Full-screen shows.
#pragma once

/// Whether some application has taken one of the first eight displays for itself; false when that cannot be
/// asked.
bool AnyDisplayIsCaptured();
