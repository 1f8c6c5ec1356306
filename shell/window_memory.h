#pragma once

#include "platform/store/profile.h"

namespace feltside {

// The window opens where the player left it the last time. Both take the section as it was last
// read, and do nothing where the machine has no windows to move.

/// The section of the profile that holds the window's place.
inline constexpr char kWindowSection[] = "Window";

/// Comes before the window is shown.
void RestoreWindowPlace(const platform::CProfileSection& stored);
/// Writes nothing where the window still is as it was restored, or was never moved.
void StoreWindowPlace(const platform::CProfileSection& stored);

}  // namespace feltside
