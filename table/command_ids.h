#pragma once

namespace feltside {

// The game's commands. New, Open, About and Exit are the framework's. The numbers stay as they are:
// scripts name commands by them.
inline constexpr int kCommandHit = 32771;
inline constexpr int kCommandStand = 32772;
inline constexpr int kCommandSplit = 32773;
inline constexpr int kCommandDoubleDown = 32775;
inline constexpr int kCommandDeal = 32776;
inline constexpr int kCommandTableSetup = 32777;
inline constexpr int kCommandHelp = 32778;
inline constexpr int kCommandGameSetup = 32779;
inline constexpr int kCommandHighScores = 32781;

}  // namespace feltside
