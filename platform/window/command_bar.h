#pragma once

#include <memory>
#include <string>
#include <vector>

#include "platform/window/menu_window.h"
#include "platform/window/window.h"

namespace platform {

/// A button of a tool bar; command 0 is a separator.
struct ToolButton {
  int commandID = 0;
  std::string tip = {};  ///< its name and its key
};

/// A tool bar: equally large pictures side by side in one bitmap, a button for each.
struct ToolBarTemplate {
  int bitmapID;
  Size imageSize;
  std::vector<ToolButton> buttons;
};

/// The bar above the view that holds the menu, the tool bar and the close button.
class CCommandBar : public CWindow {
 public:
  CCommandBar(CWindow* frame, const Rect& place);

  // Each once, in this order: the tool bar stands behind the menu's title.

  void InsertMenuBar(const MenuTemplate& menu);
  /// Adds the close button.
  void AddAdornments();
  void LoadToolBar(const ToolBarTemplate& toolBar);

  /// Asks for each button whether its command may run, and for the menu whether any may, and shows
  /// it. What is shown grey is dead until it is asked again.
  void RefreshStates();
  /// Opens the menu when the key is F10 or Alt with the letter of its title.
  bool OpenMenuByKey(const KeyStroke& stroke);

  ToolTip TipAt(Point p) const override;
  void OnPaint(CSurface& surface) override;
  void OnLButtonDown(Point p) override;
  void OnMouseMove(Point p) override;
  void OnLButtonUp(Point p) override;
  void OnPressLost() override;

 private:
  struct Button {
    ToolButton tool;
    CBitmap image;
    Rect place;
    bool enabled = false;
  };
  /// What of the bar the stylus is down on.
  enum class Part { kNone, kButton, kClose };

  void OpenMenu();
  void DrawTitle(CSurface& surface) const;
  void DrawTools(CSurface& surface) const;
  void DrawClose(CSurface& surface) const;
  Rect PressedPlace() const;

  MenuTemplate m_menu;
  Rect m_rcTitle;
  Rect m_rcClose;
  std::vector<Button> m_arrButtons;
  std::vector<int> m_arrSeparators;  ///< x of each
  std::unique_ptr<CMenuWindow> m_pMenu;
  bool m_bMenuOpen = false;
  bool m_bMenuEnabled = false;
  Part m_ePressed = Part::kNone;
  std::size_t m_nPressedButton = 0;
  bool m_bStylusInside = false;  ///< still on what it went down on
};

}  // namespace platform
