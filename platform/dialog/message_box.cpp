#include "platform/dialog/message_box.h"

#include <algorithm>

#include "platform/dialog/dialog.h"
#include "platform/draw/look.h"
#include "platform/draw/wrapped_text.h"
#include "platform/window/application.h"

namespace platform {
namespace {

// All in dialog units.
constexpr int kWidth = 130;
constexpr int kMargin = 8;
constexpr int kLineHeight = 8;
constexpr UnitRect kButton{0, 0, 40, 14};

/// A text in which every '&' is only a sign.
std::string Literally(const std::string& text) {
  std::string literal;
  for (const char sign : text) literal.append(sign == '&' ? 2 : 1, sign);
  return literal;
}

DialogTemplate FormFor(const std::string& message, MessageBoxButtons buttons) {
  const std::string text = Literally(message);
  const auto lines = WrapText(text, UnitsAcross(kWidth - 2 * kMargin));
  const int textHeight = static_cast<int>(lines.size()) * kLineHeight;
  const int buttonTop = kMargin + textHeight + kMargin;
  const auto button = [buttonTop](ControlKind kind, MessageBoxResult result, const char* label,
                                  int x) {
    return ControlTemplate{
        kind, static_cast<int>(result), label, {x, buttonTop, kButton.width, kButton.height}};
  };
  DialogTemplate form{TheApp().Name(), kWidth, buttonTop + kButton.height + kMargin, {}};
  form.controls.push_back({ControlKind::kStatic,
                           kNoControlID,
                           text,
                           {kMargin, kMargin, kWidth - 2 * kMargin, textHeight}});
  if (buttons == MessageBoxButtons::kOk) {
    form.controls.push_back(button(ControlKind::kDefaultButton, MessageBoxResult::kOk, "OK",
                                   (kWidth - kButton.width) / 2));
  } else {
    const int left = kWidth / 2 - kButton.width - 3;
    form.controls.push_back(
        button(ControlKind::kDefaultButton, MessageBoxResult::kYes, "&Yes", left));
    form.controls.push_back(
        button(ControlKind::kPushButton, MessageBoxResult::kNo, "&No", kWidth / 2 + 3));
  }
  return form;
}

class CMessageBox : public CDialog {
 public:
  CMessageBox(const std::string& text, MessageBoxButtons buttons)
      : CDialog(FormFor(text, buttons)), m_eButtons(buttons) {}

  void OnButton(int controlID) override { EndDialog(controlID); }
  void OnCancel() override {
    EndDialog(static_cast<int>(m_eButtons == MessageBoxButtons::kOk ? MessageBoxResult::kCancel
                                                                    : MessageBoxResult::kNo));
  }

 private:
  MessageBoxButtons m_eButtons;
};

}  // namespace

MessageBoxResult MessageBox(const std::string& text, MessageBoxButtons buttons) {
  return static_cast<MessageBoxResult>(CMessageBox(text, buttons).DoModal());
}

}  // namespace platform
