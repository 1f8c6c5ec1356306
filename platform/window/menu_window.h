#pragma once

#include <functional>
#include <string>
#include <vector>

#include "platform/window/top_window.h"

namespace platform {

/// A line of a menu; command 0 is a separator.
struct MenuItem {
  std::string text;  ///< '&' marks a letter
  int commandID = 0;
};

/// A pop-up menu with its title in the command bar.
struct MenuTemplate {
  std::string title;
  std::vector<MenuItem> items;
};

/// The letter that stands for an item, as a capital: the marked one, else the first; 0 for an empty
/// text.
char LetterOf(const std::string& itemText);

/// An open menu; at its right edge stand the keys that its items have. A chosen command is posted
/// to the queue; then, or when it is left, the menu closes.
class CMenuWindow : public CTopWindow {
 public:
  /// The menu opens downwards from a place on the screen. It asks which items are enabled once,
  /// when it opens. What is called when it has closed must not destroy it.
  CMenuWindow(const MenuTemplate& menu, Point at, std::function<void()> onClosed);

  /// Highlights the first item of a menu that has just opened, as one opened by a key does.
  void SelectFirst() { Step(1); }

  /// The title and the line under the highlight.
  Phrases Words() const override;
  void OnPaint(CSurface& surface) override;
  void OnLButtonDown(Point p) override { Track(p); }
  void OnMouseMove(Point p) override { Track(p); }
  void OnLButtonUp(Point p) override;
  void OnMouseHover(Point p) override;
  bool OnKeyDown(const KeyStroke& stroke) override;
  void OnPressOutside() override { Dismiss(); }

 private:
  struct Line {
    MenuItem item;
    std::string key;
    Rect place;
    bool enabled = false;
  };

  static Rect PlaceOf(const MenuTemplate& menu, Point at);
  void DrawLine(CSurface& surface, std::size_t index) const;
  int LineAt(Point p) const;
  void Track(Point p) { Select(LineAt(p)); }
  void Select(int line);
  void Step(int direction);
  bool ChooseByLetter(char letter);
  void Choose(int line);
  void Dismiss();

  std::vector<Line> m_arrLines;
  std::function<void()> m_fnClosed;
  int m_nSelected = -1;  ///< the highlighted line; -1: none
  int m_nHovered = -1;   ///< the line under the mouse; -1: none
};

}  // namespace platform
