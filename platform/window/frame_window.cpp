#include "platform/window/frame_window.h"

#include <array>
#include <utility>

#include "platform/window/application.h"

namespace platform {

CFrameWindow::CFrameWindow(const std::string& title, std::vector<Accelerator> accelerators)
    : CTopWindow(title, RectAt({}, TheApp().Screen().GetSize())),
      m_arrAccelerators(std::move(accelerators)) {}

Rect CFrameWindow::ViewPlace() const {
  const Rect client = GetClientRect();
  return {0, kBarHeight, client.right, client.bottom};
}

void CFrameWindow::SetView(std::unique_ptr<CView> view) {
  m_pView = std::move(view);
  SetFocus(m_pView.get());
}

CCommandTarget* CFrameWindow::TargetOf(int commandID) {
  if (!IsEnabled()) return nullptr;
  const std::array<CCommandTarget*, 3> targets = {m_pView.get(), this, &TheApp()};
  for (CCommandTarget* target : targets) {
    const CommandState state = target->QueryCommand(commandID);
    if (state != CommandState::kUnknown) {
      return state == CommandState::kEnabled ? target : nullptr;
    }
  }
  return nullptr;
}

bool CFrameWindow::IsCommandEnabled(int commandID) { return TargetOf(commandID) != nullptr; }

bool CFrameWindow::ExecuteCommand(int commandID) {
  CCommandTarget* target = TargetOf(commandID);
  if (target != nullptr) target->RunCommand(commandID);
  return target != nullptr;
}

std::string CFrameWindow::KeyOf(int commandID) const {
  for (const Accelerator& accelerator : m_arrAccelerators) {
    if (accelerator.commandID == commandID) return ChordText(accelerator.stroke);
  }
  return {};
}

bool CFrameWindow::OnKeyDown(const KeyStroke& stroke) {
  for (const Accelerator& accelerator : m_arrAccelerators) {
    if (accelerator.stroke == stroke) {
      TheApp().Queue().PostCommand(accelerator.commandID);
      return true;
    }
  }
  return false;
}

}  // namespace platform
