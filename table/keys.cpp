// The table played by keyboard. A key works exactly when the button that it stands for would.

#include "platform/window/application.h"
#include "table/command_ids.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

/// The command that a key stands for; 0 for none.
int CommandOf(char key) {
  switch (key) {
    case 'H':
      return kCommandHit;
    case 'S':
      return kCommandStand;
    case 'D':
      return kCommandDoubleDown;
    case 'P':
      return kCommandSplit;
    default:
      return 0;
  }
}

}  // namespace

bool CFeltsideView::OnKeyDown(const platform::KeyStroke& stroke) {
  if (stroke.ctrl || stroke.alt) return false;
  const bool deals = stroke.key == platform::Key::kEnter || stroke.character == ' ';
  if (deals) return KeyDeal();
  if (stroke.key != platform::Key::kCharacter) return false;
  if (m_nGameType == kGameVideoPoker) return KeyMark(stroke.character);
  if (const int commandID = CommandOf(stroke.character); commandID != 0) {
    platform::TheApp().MainFrame()->ExecuteCommand(commandID);
    return true;
  }
  return KeyTableButton(stroke.character);
}

bool CFeltsideView::KeyDeal() {
  if (m_nGameType == kGameVideoPoker && m_bHandInProgress != 0) {
    DrawVideoPoker();
  } else {
    platform::TheApp().MainFrame()->ExecuteCommand(kCommandDeal);
  }
  return true;
}

bool CFeltsideView::KeyMark(char key) {
  const int slot = key - '1';
  if (m_bDrawPending == 0 || slot < 0 || slot >= m_handPoker.GetCount()) return false;
  ToggleDiscard(slot);
  return true;
}

bool CFeltsideView::KeyTableButton(char key) {
  if (m_bInsuranceOffered != 0 && (key == 'I' || key == 'N')) {
    AnswerInsurance(key == 'I' ? 1 : 0);
    return true;
  }
  if (m_bHandInProgress == 0 && key == '+') {
    RaiseBet();
  } else if (m_bHandInProgress == 0 && key == '-') {
    LowerBet();
  } else if (key == 'B' && IsStrategyButtonLive()) {
    m_bShowAdvice = 1;
  } else {
    return false;
  }
  Repaint();
  return true;
}

}  // namespace feltside
