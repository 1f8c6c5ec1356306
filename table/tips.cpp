// What the buttons on the table are called, and which keys stand for them.

#include "table/feltside_view.h"

namespace feltside {

using platform::ToolTip;

ToolTip CFeltsideView::TipAt(platform::Point p) const {
  if (m_bShowTitle != 0) return {};
  for (const ToolTip& tip : m_nGameType == kGameVideoPoker ? VideoPokerTips() : BlackjackTips()) {
    if (tip.tool.Contains(p)) return tip;
  }
  return {};
}

std::vector<ToolTip> CFeltsideView::BlackjackTips() const {
  std::vector<ToolTip> tips = {{"Lower the bet (-)", m_layout.BetDownPicture()},
                               {"Raise the bet (+)", m_layout.BetUpPicture()}};
  if (m_bInsuranceOffered != 0) {
    tips.push_back({"Take insurance (I)", m_layout.InsuranceYesRect()});
    tips.push_back({"Decline insurance (N)", m_layout.InsuranceNoPicture()});
  }
  if (m_bHandInProgress != 0 && IsStrategyButtonLive()) {
    tips.push_back({"Strategy (B)", m_layout.StrategyButtonRect()});
  }
  return tips;
}

std::vector<ToolTip> CFeltsideView::VideoPokerTips() const {
  return {{m_bHandInProgress != 0 ? "Play (Enter)" : "Deal (Enter)",
           m_bFancyPoker != 0 ? CTableLayout::kFancyDealButton : m_layout.DealButtonRect()}};
}

}  // namespace feltside
