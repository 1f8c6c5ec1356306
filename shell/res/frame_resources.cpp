#include "shell/res/frame_resources.h"

#include "table/command_ids.h"

namespace feltside {
namespace {
constexpr int kSeparator = 0;
}  // namespace

platform::MenuTemplate MainMenu() {
  return {"&BlackJack",
          {{"&Game Setup", kCommandGameSetup},
           {"&Table Setup ", kCommandTableSetup},
           {"", kSeparator},
           {"High Scores", kCommandHighScores},
           {"&About...", platform::kCommandAbout},
           {"Help...", kCommandHelp},
           {"", kSeparator},
           {"E&xit", platform::kCommandExit}}};
}

platform::ToolBarTemplate MainToolBar() {
  return {IDR_MAINFRAME,
          {16, 15},
          {{kCommandHit, "Hit (H)"},
           {kCommandStand, "Stand (S)"},
           {kSeparator},
           {kCommandDoubleDown, "Double Down (D)"},
           {kSeparator},
           {kCommandSplit, "Split (P)"},
           {kSeparator},
           {kCommandDeal, "Deal (Enter)"}}};
}

std::vector<platform::Accelerator> MainAccelerators() {
  const auto ctrl = [](char letter) {
    return platform::KeyStroke{.key = platform::Key::kCharacter, .character = letter, .ctrl = true};
  };
  return {{ctrl('N'), platform::kCommandNew},
          {ctrl('O'), platform::kCommandOpen},
          {ctrl('Q'), platform::kCommandExit},
          {{.key = platform::Key::kF1}, kCommandHelp}};
}

}  // namespace feltside
