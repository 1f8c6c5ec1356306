#include "shell/main_frame.h"

#include "shell/res/frame_resources.h"

namespace feltside {

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

bool CMainFrame::OnKeyDown(const platform::KeyStroke& stroke) {
  return m_wndCommandBar.OpenMenuByKey(stroke) || CFrameWindow::OnKeyDown(stroke);
}

}  // namespace feltside
