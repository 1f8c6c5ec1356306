#pragma once

#include "platform/dialog/dialog.h"

namespace feltside {

/// A colour by three sliders. Set the colour, run it, and read it after OK.
class CEditColorDlg : public platform::CDialog {
 public:
  CEditColorDlg();

  bool OnInitDialog() override;
  void OnVScroll(int controlID) override;
  std::optional<platform::Color> OnCtlColor(int controlID) const override;

  platform::Color m_crColor = platform::kWhite;

 private:
  /// Shows each slider's position in the number box above it.
  void SyncNumbers();
};

}  // namespace feltside
