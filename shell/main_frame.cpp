#include "shell/main_frame.h"

#include <array>

#include "platform/window/application.h"
#include "shell/res/frame_resources.h"
#include "table/command_ids.h"

namespace feltside {

struct CMainFrame::Commands {
  static constexpr std::array<platform::CommandEntry<CMainFrame>, 1> kMap = {{
      {kCommandHelp, &CMainFrame::OnHelp},
  }};
};

CMainFrame::CMainFrame(const std::string& title)
    : CFrameWindow(title, MainAccelerators()),
      m_wndCommandBar(this, {0, 0, GetClientRect().right, kBarHeight}) {}

int CMainFrame::OnCreate() {
  if (CFrameWindow::OnCreate() != 0) return -1;
  m_wndCommandBar.InsertMenuBar(MainMenu());
  m_wndCommandBar.AddAdornments();
  m_wndCommandBar.LoadToolBar(MainToolBar());
  return 0;
}

platform::CommandState CMainFrame::QueryCommand(int commandID) const {
  return QueryCommandMap(*this, Commands::kMap, commandID);
}

void CMainFrame::RunCommand(int commandID) { RunCommandMap(*this, Commands::kMap, commandID); }

void CMainFrame::OnHelp() { platform::TheApp().ShowHelp("file:feltside.htm#Main_Contents"); }

bool CMainFrame::OnKeyDown(const platform::KeyStroke& stroke) {
  return m_wndCommandBar.OpenMenuByKey(stroke) || CFrameWindow::OnKeyDown(stroke);
}

}  // namespace feltside
