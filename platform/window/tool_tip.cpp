#include "platform/window/tool_tip.h"

#include <algorithm>
#include <utility>

#include "platform/draw/look.h"
#include "platform/host/host.h"

namespace platform {
namespace {

constexpr int kPauseMilliseconds = 500;
constexpr Color kTipColor = Rgb(255, 255, 225);
constexpr Size kPadding{4, 3};  ///< around the text, the edge included
constexpr int kGap = 2;         ///< between a tool and its tip

}  // namespace

bool CToolTipCtrl::Hover(const ToolTip& tip) {
  if (tip == m_tip) return false;
  const bool went = m_eState == State::kShown;
  m_tip = tip;
  m_eState = tip.text.empty() ? State::kAway : State::kPending;
  m_nDue = TheHost().Ticks() + kPauseMilliseconds;
  return went;
}

bool CToolTipCtrl::Dismiss() { return std::exchange(m_eState, State::kAway) == State::kShown; }

int CToolTipCtrl::TimeLeft() const {
  if (m_eState != State::kPending) return -1;
  return static_cast<int>(std::max<std::int64_t>(0, m_nDue - TheHost().Ticks()));
}

bool CToolTipCtrl::ShowWhenDue() {
  if (TimeLeft() != 0) return false;
  m_eState = State::kShown;
  return true;
}

void CToolTipCtrl::Draw(CSurface& screen) const {
  if (m_eState != State::kShown) return;
  const Size text = MeasureText(kSystemFont, m_tip.text);
  const Size size{text.width + 2 * kPadding.width, text.height + 2 * kPadding.height};
  const Rect room = screen.Bounds();
  const int below = m_tip.tool.bottom + kGap;
  const Point at{std::clamp(m_tip.tool.left, 0, std::max(0, room.right - size.width)),
                 below + size.height <= room.bottom ? below : m_tip.tool.top - kGap - size.height};
  screen.SetPen(kBlack);
  screen.SetBrush(kTipColor);
  screen.Rectangle(RectAt(at, size));
  screen.SetFont(kSystemFont);
  screen.SetBackMode(BackMode::kTransparent);
  screen.TextOut(at + Point{kPadding.width, kPadding.height}, m_tip.text);
}

}  // namespace platform
