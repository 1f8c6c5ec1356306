#pragma once

#include <memory>
#include <string>
#include <vector>

#include "platform/dialog/control.h"
#include "platform/dialog/drop_list.h"

namespace platform {

/// A list of choices that drops down from a line showing the chosen one. Its place in the template
/// is that of line and list together; the line alone is as high as its text needs.
class CComboBox : public CControl {
 public:
  CComboBox(CDialog& dialog, const ControlTemplate& control, const Rect& place);

  const char* KindName() const override { return "list"; }
  bool IsTabStop() const override { return true; }
  char Mnemonic() const override { return 0; }
  bool IsLabelled() const override { return true; }
  std::string Words(const std::string& label) const override;
  /// The place of the choice; -1 for none.
  int GetValue() const override { return m_nChoice; }
  int GetItemCount() const { return static_cast<int>(m_arrItems.size()); }
  /// Shows an item as chosen; a place outside the list leaves no choice. The dialog is not told.
  void SetCurSel(int item);
  /// Chooses an item as the person does: the dialog is told when the choice changed. Nothing for a
  /// place behind the last item.
  void Choose(int item);
  /// Drops the list.
  void Activate() override;

  void OnPaint(CSurface& surface) override;
  void OnLButtonDown(Point p) override;
  void OnMouseWheel(int notches) override;
  bool OnKeyDown(const KeyStroke& stroke) override;

 private:
  void Drop();
  void Step(int items);

  std::vector<std::string> m_arrItems;
  int m_nChoice = -1;
  std::unique_ptr<CDropList> m_pList;
};

}  // namespace platform
