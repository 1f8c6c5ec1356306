#pragma once

#include <array>

#include "platform/window/command.h"
#include "table/command_ids.h"

namespace feltside {

/// A command of the program and the name that scripts give it.
struct NamedCommand {
  const char* name;
  int commandID;
  bool shown = true;  ///< in the tool bar or the menu; the others have keys alone
};

inline constexpr std::array<NamedCommand, 13> kNamedCommands = {{
    {"hit", kCommandHit},
    {"stand", kCommandStand},
    {"double", kCommandDoubleDown},
    {"split", kCommandSplit},
    {"deal", kCommandDeal},
    {"game-setup", kCommandGameSetup},
    {"table-setup", kCommandTableSetup},
    {"scores", kCommandHighScores},
    {"about", platform::kCommandAbout},
    {"help", kCommandHelp},
    {"exit", platform::kCommandExit},
    {"new", platform::kCommandNew, false},
    {"open", platform::kCommandOpen, false},
}};

}  // namespace feltside
