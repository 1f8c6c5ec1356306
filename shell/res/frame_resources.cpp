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
          {kCommandHit, kCommandStand, kSeparator, kCommandDoubleDown, kSeparator, kCommandSplit,
           kSeparator, kCommandDeal}};
}

std::vector<platform::Accelerator> MainAccelerators() {
  const auto ctrl = [](char letter) {
    platform::KeyStroke stroke;
    stroke.key = platform::Key::kCharacter;
    stroke.character = letter;
    stroke.ctrl = true;
    return stroke;
  };
  return {{ctrl('N'), platform::kCommandNew}, {ctrl('O'), platform::kCommandOpen}};
}

}  // namespace feltside
