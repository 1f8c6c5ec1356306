#pragma once

#include <memory>
#include <string>

#include "platform/dialog/dialog_template.h"
#include "platform/window/window.h"

namespace platform {

class CDialog;

/// A control of a dialog: it has a number by which the dialog knows it, and tells the dialog what
/// is done to it.
class CControl : public CWindow {
 public:
  /// The place is in pixels of the dialog's window, which outlives the control.
  CControl(CDialog& dialog, const ControlTemplate& control, const Rect& place);

  /// Not unique among controls that nobody asks for.
  int GetID() const { return m_nID; }
  const std::string& GetText() const { return m_strText; }
  virtual void SetText(const std::string& text);
  /// A state in one number: a box's tick, a list's choice (-1 for none), a slider's position; 0
  /// where a control has none.
  virtual int GetValue() const { return 0; }
  /// What the control is, in a word.
  virtual const char* KindName() const = 0;
  /// Whether the static before it in the template is its label, and is told with it.
  virtual bool IsLabelled() const { return false; }
  /// Label, kind and value, for whoever does not see them; empty where there is nothing to tell.
  virtual std::string Words(const std::string&) const { return {}; }

  /// The letter that activates the control, as a capital; 0 for none.
  virtual char Mnemonic() const;
  /// Whether Tab stops here.
  virtual bool IsTabStop() const { return false; }
  /// Whether a letter typed here is text, so that it may not choose a control by its mnemonic.
  virtual bool WantsLetters() const { return false; }
  /// What the stylus pressing it, or its mnemonic, does.
  virtual void Activate() {}

  bool HasFocus();

 protected:
  CDialog& Dialog() const { return m_dialog; }
  /// Gives the keyboard to this control.
  void TakeFocus();

 private:
  CDialog& m_dialog;
  int m_nID;
  std::string m_strText;
};

/// The control that a template line describes.
std::unique_ptr<CControl> MakeControl(CDialog& dialog, const ControlTemplate& control,
                                      const Rect& place);

}  // namespace platform
