#pragma once

#include <vector>

#include "platform/window/command_bar.h"
#include "platform/window/frame_window.h"

namespace feltside {

/// The whole window in pixels: the command bar above a table of 240 × 268.
inline constexpr platform::Size kWindowSize{240, 294};

/// Menu, tool bar, accelerators, document string and icon of the main frame share this number.
inline constexpr int IDR_MAINFRAME = 128;

/// Window title, document name, new-file name, filter name, filter extension, file-type identifier
/// and file-type name, separated by line ends.
inline constexpr char kDocumentString[] =
    "Feltside\n\nFeltside\n\n\nFeltside.Document\nFeltside Document";

platform::MenuTemplate MainMenu();
platform::ToolBarTemplate MainToolBar();
std::vector<platform::Accelerator> MainAccelerators();

}  // namespace feltside
