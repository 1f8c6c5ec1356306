#pragma once

namespace feltside {

/// The section of the profile that holds the player's choices and the high scores.
inline constexpr char kSettingsSection[] = "Settings";

}  // namespace feltside
