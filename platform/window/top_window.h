#pragma once

#include <string>

#include "platform/window/narrator.h"
#include "platform/window/window.h"

namespace platform {

/// A window of the screen's stack: the frame, a dialog, a menu or a message box. It paints into
/// pixels of its own; the screen lays them over one another.
class CTopWindow : public CWindow {
 public:
  /// How a press beside the window is taken.
  enum class Kind {
    kNormal,  ///< goes to the window that lies there
    kPopup,   ///< closes this one and does nothing else
  };

  /// Not on the screen before it is opened.
  CTopWindow(std::string title, const Rect& place, Kind kind = Kind::kNormal);
  ~CTopWindow() override;

  const std::string& GetTitle() const { return m_strTitle; }
  Kind GetKind() const { return m_eKind; }
  const CBitmap& Pixels() const { return m_pixels; }

  /// Puts the window, which is its maker's, on top of the stack.
  void Open();
  /// Takes it off the stack; nothing where it is not there. Its destructor does it too.
  void Close();

  /// Paints into its own pixels what was invalidated; the screen shows them at the next chance.
  void PaintIfNeeded();

  /// The child that has the keyboard; null: the window itself.
  CWindow* GetFocus() const { return m_pFocus; }
  /// Gives the keyboard to a child; null: to the window itself.
  void SetFocus(CWindow* child);
  // Hand what the keyboard brings to the focused child, then outwards from there, until it means
  // something to a window; return whether it did.
  bool RouteKey(const KeyStroke& stroke);
  bool RouteText(const std::string& text);
  bool RouteComposition(const std::string& text);

  /// What the window shows, for whoever does not see it: a phrase for each thing, what is most to
  /// the point at the moment last.
  virtual Phrases Words() const { return {m_strTitle}; }
  /// A press beside a popup.
  virtual void OnPressOutside() {}
  /// A child is about to be destroyed.
  void Forget(CWindow& child);

 private:
  template <class Handler>
  bool Route(Handler handler);

  std::string m_strTitle;
  Kind m_eKind;
  CBitmap m_pixels;
  CWindow* m_pFocus = nullptr;
};

}  // namespace platform
