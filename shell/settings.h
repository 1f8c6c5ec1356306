#pragma once

namespace feltside {

/// The section of the profile that holds the player's choices and the high scores.
inline constexpr char kSettingsSection[] = "Settings";

/// What the player chooses, in the order in which it is read.
enum Setting : int {
  kGameType,
  kUseHighScores,
  kFancyPoker,
  kFancyBlackjack,
  kCardBack,
  kTableColor,
  kBoxColor,
  kMaxDiscards,
  kStrategyMode,
  kDeckChoice,
  kPlaySpeed,
  kSettingCount,
};

}  // namespace feltside
