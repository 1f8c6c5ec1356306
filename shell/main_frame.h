#pragma once

#include "platform/window/command_bar.h"
#include "platform/window/frame_window.h"

namespace feltside {

/// The program's window: the command bar with menu and tool bar above the table.
class CMainFrame : public platform::CFrameWindow {
 public:
  explicit CMainFrame(const std::string& title);

  int OnCreate() override;
  void RefreshCommandStates() override { m_wndCommandBar.RefreshStates(); }
  bool OnKeyDown(const platform::KeyStroke& stroke) override;
  platform::CommandState QueryCommand(int commandID) const override;
  void RunCommand(int commandID) override;

 private:
  struct Commands;

  void OnHelp();

  platform::CCommandBar m_wndCommandBar;
};

}  // namespace feltside
