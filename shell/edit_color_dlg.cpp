#include "shell/edit_color_dlg.h"

#include <array>

#include "platform/dialog/slider.h"
#include "platform/dialog/up_down.h"
#include "shell/res/dialog_templates.h"

namespace feltside {
namespace {

constexpr int kParts = 3;  ///< red, green, blue
constexpr int kBrightest = 255;
constexpr int kLineStep = 10;
constexpr int kPageStep = 50;

}  // namespace

CEditColorDlg::CEditColorDlg() : CDialog(EditColorTemplate()) {}

bool CEditColorDlg::OnInitDialog() {
  CDialog::OnInitDialog();
  const std::array<int, kParts> values = {platform::RedOf(m_crColor), platform::GreenOf(m_crColor),
                                          platform::BlueOf(m_crColor)};
  for (int part = 0; part < kParts; ++part) {
    auto& slider = Item<platform::CSlider>(kColorFirstSlider + part);
    slider.SetRange(0, kBrightest);
    slider.SetSteps(kLineStep, kPageStep);
    slider.SetPos(values[static_cast<std::size_t>(part)]);
    Item<platform::CUpDown>(kColorFirstUpDown + part).SetRange(0, kBrightest);
  }
  SyncNumbers();
  return true;
}

void CEditColorDlg::SyncNumbers() {
  for (int part = 0; part < kParts; ++part) {
    Item<platform::CUpDown>(kColorFirstUpDown + part)
        .SetPos(GetDlgItem(kColorFirstSlider + part)->GetValue());
  }
}

void CEditColorDlg::OnVScroll(int) {
  m_crColor = platform::Rgb(GetDlgItem(kColorFirstSlider)->GetValue(),
                            GetDlgItem(kColorFirstSlider + 1)->GetValue(),
                            GetDlgItem(kColorFirstSlider + 2)->GetValue());
  SyncNumbers();
  GetDlgItem(kColorSample)->Invalidate();
}

std::optional<platform::Color> CEditColorDlg::OnCtlColor(int controlID) const {
  if (controlID == kColorSample) return m_crColor;
  return std::nullopt;
}

}  // namespace feltside
