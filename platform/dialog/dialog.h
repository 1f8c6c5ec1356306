#pragma once

#include <memory>
#include <optional>
#include <vector>

#include "platform/dialog/control.h"
#include "platform/dialog/dialog_template.h"
#include "platform/window/top_window.h"

namespace platform {

inline constexpr int kResultOk = 1;
inline constexpr int kResultCancel = 2;

/// A window that is worked with until it is closed, while everything beneath it is dead. It is
/// built from a template, moved by its caption, off the screen but for a grip of it, and closed by
/// its buttons, by Escape or by the cross in its caption.
///
/// Keys: Tab and Shift+Tab go from control to control, Enter pushes the default button, a control's
/// marked letter (with Alt, or alone where no text is typed) activates it, F1 asks for help.
class CDialog : public CTopWindow {
 public:
  /// Makes the controls and places the dialog in the middle of the screen, not yet open.
  explicit CDialog(const DialogTemplate& form);
  ~CDialog() override;

  /// Runs the dialog and returns how it was ended. When the program is to end meanwhile, it is
  /// cancelled.
  int DoModal();
  /// Has DoModal return this result once the handler that calls it is over.
  void EndDialog(int result);

  const std::vector<std::unique_ptr<CControl>>& Controls() const { return m_arrControls; }
  /// The control of that number; null for none.
  CControl* GetDlgItem(int controlID) const;
  /// The control of that number, which the template must have as one of that class.
  template <class Control>
  Control& Item(int controlID) const {
    return static_cast<Control&>(*GetDlgItem(controlID));
  }
  /// Gives the keyboard to the tab stop that follows a control.
  void FocusAfter(const CControl& control);
  /// What a push button of that number does: OK and Cancel by their handlers, others by OnButton.
  void Push(int controlID);

  // What a dialog may answer to. A number is that of the control.

  /// The controls are made; the derived dialog fills them. True: the keyboard goes to the first tab
  /// stop.
  virtual bool OnInitDialog();
  virtual void OnOK();
  virtual void OnCancel() { EndDialog(kResultCancel); }
  virtual void OnButton(int) {}
  virtual void OnSelChange(int) {}
  virtual void OnVScroll(int) {}
  /// The one colour that a patch is to have; nothing leaves it as it is.
  virtual std::optional<Color> OnCtlColor(int) const { return std::nullopt; }
  /// Paints what the dialog has besides its controls, in client pixels.
  virtual void OnPaintClient(CSurface&) {}
  /// Whether there is help to ask for: then the caption has a question mark.
  virtual bool HasHelp() const { return false; }
  virtual void OnHelp() {}

  /// The title, the texts, then the control that has the keyboard.
  Phrases Words() const override;
  void OnPaint(CSurface& surface) override;
  void OnLButtonDown(Point p) override;
  void OnMouseMove(Point p) override;
  void OnLButtonUp(Point p) override;
  void OnPressLost() override;
  bool OnKeyDown(const KeyStroke& stroke) override;

 protected:
  enum class Exchange { kToControls, kFromControls };
  /// Carries values between members and controls, one way or the other.
  virtual void DoDataExchange(Exchange) {}
  /// A check box and a flag of 0 or 1.
  void ExchangeCheck(Exchange direction, int controlID, int& flag) const;

 private:
  static Rect PlaceFor(const DialogTemplate& form);
  Rect ClientPlace() const;
  Rect CloseButton() const;
  Rect HelpButton() const;
  void MakeControls(const DialogTemplate& form);
  bool IsLabel(std::size_t control) const;
  std::string WordsOf(std::size_t control) const;
  void DrawCaption(CSurface& surface) const;
  void FocusStep(int direction);
  void FocusFrom(std::size_t start, int direction);
  bool PushDefault();
  bool ActivateByLetter(char letter);
  void MoveBy(Point by);

  std::vector<std::unique_ptr<CControl>> m_arrControls;
  bool m_bEnded = false;
  int m_nResult = kResultCancel;
  bool m_bMoving = false;  ///< under the stylus that is down, by its caption
  Point m_ptGrip;          ///< where the caption was taken
  Rect m_rcPressed;        ///< the caption's button that the stylus went down on; empty: none
  bool m_bInside = false;  ///< still on it
};

}  // namespace platform
