#pragma once

#include <cstdint>
#include <string>

#include "platform/draw/surface.h"

namespace platform {

/// A tool and what is said of it; an empty text: nothing. Its place is in pixels of the window that
/// it stands in.
struct ToolTip {
  std::string text;
  Rect tool;

  friend bool operator==(const ToolTip&, const ToolTip&) = default;
};

/// Shows the tip of the tool on which a mouse rests: after a pause, until the mouse goes on or
/// something is pressed. Once it was pressed away it stays away until the mouse has left the tool.
class CToolTipCtrl {
 public:
  /// The mouse is over a tool; the place is on the screen. Returns whether a tip went.
  bool Hover(const ToolTip& tip);
  /// Something was pressed. Returns whether a tip went.
  bool Dismiss();
  /// Milliseconds until a tip is due; below 0 where none is pending.
  int TimeLeft() const;
  /// Shows the tip if it is due; returns whether it came.
  bool ShowWhenDue();

  /// What is shown; empty while no tip is.
  std::string GetText() const { return m_eState == State::kShown ? m_tip.text : ""; }
  /// Draws what is shown below its tool, or above it where there is no room below.
  void Draw(CSurface& screen) const;

 private:
  enum class State { kAway, kPending, kShown };

  ToolTip m_tip;  ///< of the tool under the mouse
  State m_eState = State::kAway;
  std::int64_t m_nDue = 0;  ///< in the host's ticks, while it is pending
};

}  // namespace platform
