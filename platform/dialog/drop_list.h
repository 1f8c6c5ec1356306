#pragma once

#include <functional>
#include <string>
#include <vector>

#include "platform/window/top_window.h"

namespace platform {

/// The first item from a place on, going round, that begins with a letter; -1 for none.
int NextItemByLetter(const std::vector<std::string>& items, int from, char letter);

/// The open list of a combo box. It closes when an item is chosen, with Escape, or with a press
/// beside it.
class CDropList : public CTopWindow {
 public:
  /// Below a line of the screen, or above it where there is no room below.
  CDropList(const std::vector<std::string>& items, int chosen, const Rect& line,
            std::function<void(int item)> onChosen);

  /// The item under the highlight.
  Phrases Words() const override;
  void OnPaint(CSurface& surface) override;
  void OnLButtonDown(Point p) override { Highlight(ItemAt(p)); }
  void OnMouseMove(Point p) override;
  void OnLButtonUp(Point p) override;
  void OnMouseHover(Point p) override;
  void OnMouseWheel(int notches) override { Step(-notches); }
  bool OnKeyDown(const KeyStroke& stroke) override;
  void OnPressOutside() override { Close(); }

 private:
  static Rect PlaceFor(std::size_t items, const Rect& line);
  int ItemAt(Point p) const;
  void Highlight(int item);
  void Step(int items);
  void Choose();

  std::vector<std::string> m_arrItems;
  int m_nHighlighted;
  int m_nHovered = -1;  ///< the item under the mouse; -1: none
  std::function<void(int item)> m_fnChosen;
};

}  // namespace platform
