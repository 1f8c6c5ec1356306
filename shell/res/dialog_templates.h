#pragma once

#include "platform/dialog/dialog_template.h"

namespace feltside {

platform::DialogTemplate AboutTemplate();
platform::DialogTemplate SetupTemplate();
platform::DialogTemplate SetupTableTemplate();
platform::DialogTemplate EditColorTemplate();
platform::DialogTemplate HighScoresTemplate();

// Control numbers; OK and Cancel have the layer's.

inline constexpr int kSetupGameType = 1000;
inline constexpr int kSetupSpeed = 1007;
inline constexpr int kSetupStrategy = 1008;
inline constexpr int kSetupDecks = 1009;

inline constexpr int kTableCardBack = 1005;
inline constexpr int kTableFancyPoker = 1010;
inline constexpr int kTableUseHighScores = 1012;
inline constexpr int kTableFiveDiscards = 1013;
inline constexpr int kTableFancyBlackjack = 1014;
inline constexpr int kTableColorButton = 1500;
inline constexpr int kTableColorSwatch = 1501;
inline constexpr int kTableBoxButton = 1502;
inline constexpr int kTableBoxSwatch = 1503;

inline constexpr int kColorSample = 1012;
// Red; green and blue have the two numbers that follow.
inline constexpr int kColorFirstSlider = 6000;
inline constexpr int kColorFirstNumber = 6003;
inline constexpr int kColorFirstUpDown = 6006;

inline constexpr int kScoresAdd = 1011;
inline constexpr int kScoresFirstLine = 6009;  ///< of five
inline constexpr int kScoresNameLabel = 6014;
inline constexpr int kScoresMessage = 6015;
inline constexpr int kScoresName = 6016;

}  // namespace feltside
