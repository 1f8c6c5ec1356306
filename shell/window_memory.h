#pragma once

namespace feltside {

// The window opens where the player left it the last time. Both take the application's profile, and
// do nothing where the machine has no windows to move.

/// Comes before the window is shown.
void RestoreWindowPlace();
/// Writes nothing where the window still is as it was restored, or was never moved.
void StoreWindowPlace();

}  // namespace feltside
