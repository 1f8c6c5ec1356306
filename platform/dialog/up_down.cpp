#include "platform/dialog/up_down.h"

#include <algorithm>

namespace platform {

void CUpDown::SetRange(int lowest, int highest) {
  m_nLowest = lowest;
  m_nHighest = highest;
}

void CUpDown::SetPos(int pos) {
  m_nPos = std::clamp(pos, m_nLowest, m_nHighest);
  if (m_pBuddy != nullptr) m_pBuddy->SetText(std::to_string(m_nPos));
}

}  // namespace platform
