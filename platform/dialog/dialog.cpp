#include "platform/dialog/dialog.h"

#include <algorithm>

#include "platform/dialog/check_box.h"
#include "platform/dialog/push_button.h"
#include "platform/dialog/up_down.h"
#include "platform/draw/look.h"
#include "platform/window/application.h"

namespace platform {
namespace {

constexpr int kBorder = 1;
constexpr int kCaptionHeight = 19;
/// As much of the caption stays on the screen as it takes to pull the dialog back.
constexpr int kGripWidth = 48;
constexpr Size kCaptionButton{15, 13};

bool CanTake(const CControl& control) {
  return control.IsVisible() && control.IsEnabled() && control.IsTabStop();
}

/// Disables every window of the screen for as long as it lives, so that nothing but what is opened
/// later takes input.
class DeadBackground {
 public:
  DeadBackground() {
    for (CTopWindow* window : TheApp().Screen().Windows()) {
      if (!window->IsEnabled()) continue;
      window->EnableWindow(false);
      m_arrWindows.push_back(window);
    }
  }
  ~DeadBackground() {
    for (CTopWindow* window : m_arrWindows) window->EnableWindow(true);
  }
  DeadBackground(const DeadBackground&) = delete;
  DeadBackground& operator=(const DeadBackground&) = delete;

 private:
  std::vector<CTopWindow*> m_arrWindows;
};

}  // namespace

CDialog::CDialog(const DialogTemplate& form) : CTopWindow(form.title, PlaceFor(form)) {
  MakeControls(form);
}

CDialog::~CDialog() = default;

Rect CDialog::PlaceFor(const DialogTemplate& form) {
  const Size size{UnitsAcross(form.width) + 2 * kBorder,
                  UnitsDown(form.height) + kCaptionHeight + 2 * kBorder};
  const Size screen = TheApp().Screen().GetSize();
  return RectAt({(screen.width - size.width) / 2, (screen.height - size.height) / 2}, size);
}

Rect CDialog::ClientPlace() const {
  const Rect window = GetClientRect();
  return {kBorder, kBorder + kCaptionHeight, window.right - kBorder, window.bottom - kBorder};
}

Rect CDialog::CloseButton() const {
  const int top = kBorder + (kCaptionHeight - kCaptionButton.height) / 2;
  return RectAt({GetClientRect().right - kBorder - 3 - kCaptionButton.width, top}, kCaptionButton);
}

Rect CDialog::HelpButton() const {
  return HasHelp() ? CloseButton().Moved({-kCaptionButton.width - 2, 0}) : Rect{};
}

void CDialog::MakeControls(const DialogTemplate& form) {
  CControl* previous = nullptr;
  for (const ControlTemplate& line : form.controls) {
    const Rect place = ToPixels(line.place).Moved(ClientPlace().TopLeft());
    m_arrControls.push_back(MakeControl(*this, line, place));
    CControl* control = m_arrControls.back().get();
    if (line.kind == ControlKind::kUpDown) {
      static_cast<CUpDown*>(control)->SetBuddy(previous);
      control->ShowWindow(false);
    }
    previous = control;
  }
}

int CDialog::DoModal() {
  CTopWindow* below = TheApp().Screen().Top();
  CWindow* focusBelow = below == nullptr ? nullptr : below->GetFocus();
  if (focusBelow != nullptr) focusBelow->OnFocus(false);
  // The table is not painted while a dialog is open, which needs about as much as its pictures.
  TheApp().Resources().Forget();
  {
    const DeadBackground dead;
    Open();
    if (OnInitDialog()) FocusFrom(0, 1);
    TheApp().RunUntil([this] { return m_bEnded; });
  }
  SetFocus(nullptr);
  Close();
  if (focusBelow != nullptr) focusBelow->OnFocus(true);
  return m_bEnded ? m_nResult : kResultCancel;
}

void CDialog::EndDialog(int result) {
  m_bEnded = true;
  m_nResult = result;
}

bool CDialog::OnInitDialog() {
  DoDataExchange(Exchange::kToControls);
  return true;
}

void CDialog::OnOK() {
  DoDataExchange(Exchange::kFromControls);
  EndDialog(kResultOk);
}

void CDialog::ExchangeCheck(Exchange direction, int controlID, int& flag) const {
  auto& box = Item<CCheckBox>(controlID);
  if (direction == Exchange::kToControls) {
    box.SetCheck(flag != 0);
  } else {
    flag = box.GetValue();
  }
}

CControl* CDialog::GetDlgItem(int controlID) const {
  for (const auto& control : m_arrControls) {
    if (control->GetID() == controlID) return control.get();
  }
  return nullptr;
}

void CDialog::Push(int controlID) {
  if (controlID == kResultOk) {
    OnOK();
  } else if (controlID == kResultCancel) {
    OnCancel();
  } else {
    OnButton(controlID);
  }
}

void CDialog::FocusFrom(std::size_t start, int direction) {
  const std::size_t count = m_arrControls.size();
  std::size_t at = start;
  for (std::size_t i = 0; i < count; ++i) {
    if (CanTake(*m_arrControls[at])) return SetFocus(m_arrControls[at].get());
    at = (at + count + static_cast<std::size_t>(direction)) % count;
  }
}

void CDialog::FocusStep(int direction) {
  const std::size_t count = m_arrControls.size();
  for (std::size_t i = 0; i < count; ++i) {
    if (m_arrControls[i].get() != GetFocus()) continue;
    return FocusFrom((i + count + static_cast<std::size_t>(direction)) % count, direction);
  }
  FocusFrom(direction > 0 ? 0 : count - 1, direction);
}

void CDialog::FocusAfter(const CControl& control) {
  for (std::size_t i = 0; i + 1 < m_arrControls.size(); ++i) {
    if (m_arrControls[i].get() == &control) return FocusFrom(i + 1, 1);
  }
}

bool CDialog::PushDefault() {
  for (const auto& control : m_arrControls) {
    const auto* button = dynamic_cast<const CPushButton*>(control.get());
    if (button == nullptr || !button->IsDefault()) continue;
    if (button->IsVisible() && button->IsEnabled()) Push(button->GetID());
    return true;
  }
  OnOK();
  return true;
}

bool CDialog::ActivateByLetter(char letter) {
  for (const auto& control : m_arrControls) {
    if (letter == 0 || control->Mnemonic() != letter) continue;
    if (!control->IsVisible() || !control->IsEnabled()) continue;
    if (control->IsTabStop()) SetFocus(control.get());
    control->Activate();
    return true;
  }
  return false;
}

bool CDialog::OnKeyDown(const KeyStroke& stroke) {
  const auto* focus = static_cast<const CControl*>(GetFocus());
  switch (stroke.key) {
    case Key::kTab:
      FocusStep(stroke.shift ? -1 : 1);
      return true;
    case Key::kEnter:
      return PushDefault();
    case Key::kEscape:
      OnCancel();
      return true;
    case Key::kF1:
      if (HasHelp()) OnHelp();
      return true;
    case Key::kCharacter:
      if (stroke.ctrl) return false;
      if (!stroke.alt && focus != nullptr && focus->WantsLetters()) return false;
      return ActivateByLetter(stroke.character);
    default:
      return false;
  }
}

Phrases CDialog::Words() const {
  Phrases words = {GetTitle()};
  std::string focused;
  for (std::size_t i = 0; i < m_arrControls.size(); ++i) {
    const CControl& control = *m_arrControls[i];
    if (&control == GetFocus()) focused = WordsOf(i);
    if (!control.IsVisible() || control.IsTabStop() || IsLabel(i)) continue;
    words.push_back(WordsOf(i));
  }
  words.push_back(focused);
  return words;
}

/// Whether a control is the label of the next one.
bool CDialog::IsLabel(std::size_t control) const {
  return control + 1 < m_arrControls.size() && m_arrControls[control + 1]->IsLabelled();
}

std::string CDialog::WordsOf(std::size_t control) const {
  const bool labelled = control > 0 && IsLabel(control - 1);
  return m_arrControls[control]->Words(labelled ? m_arrControls[control - 1]->Words({}) : "");
}

void CDialog::OnPaint(CSurface& surface) {
  surface.SetPen(kBlack);
  surface.SetBrush(kFaceColor);
  surface.Rectangle(GetClientRect());
  DrawCaption(surface);
  CSurface client(surface, ClientPlace());
  OnPaintClient(client);
}

void CDialog::DrawCaption(CSurface& surface) const {
  const Rect bar{kBorder, kBorder, GetClientRect().right - kBorder, kBorder + kCaptionHeight};
  surface.FillRect(bar, kHighlight);
  surface.SetFont({kSystemFont.height, true});
  surface.SetBackMode(BackMode::kTransparent);
  surface.SetTextColor(kWhite);
  surface.TextOut({bar.left + 5, bar.top + 3}, GetTitle());
  const Rect close = CloseButton();
  DrawButtonFace(surface, close, m_bInside && m_rcPressed == close);
  DrawCross(surface, close);
  if (!HasHelp()) return;
  DrawButtonFace(surface, HelpButton(), m_bInside && m_rcPressed == HelpButton());
  surface.SetTextColor(kBlack);
  surface.TextOut(HelpButton().TopLeft() + Point{4, 0}, "?");
}

void CDialog::OnLButtonDown(Point p) {
  m_ptGrip = p;
  m_rcPressed = CloseButton().Contains(p)  ? CloseButton()
                : HelpButton().Contains(p) ? HelpButton()
                                           : Rect{};
  m_bInside = !m_rcPressed.IsEmpty();
  m_bMoving = p.y < ClientPlace().top && !m_bInside;
  Invalidate();
}

void CDialog::OnMouseMove(Point p) {
  if (m_bMoving) MoveBy(p - m_ptGrip);
  if (m_bInside == m_rcPressed.Contains(p)) return;
  m_bInside = !m_bInside;
  Invalidate();
}

void CDialog::OnPressLost() {
  m_bInside = false;
  m_rcPressed = {};
  Invalidate();
}

void CDialog::OnLButtonUp(Point p) {
  const Rect released = m_rcPressed.Contains(p) ? m_rcPressed : Rect{};
  OnPressLost();
  if (released.IsEmpty()) return;
  if (released == CloseButton()) {
    OnCancel();
  } else {
    OnHelp();
  }
}

void CDialog::MoveBy(Point by) {
  const Rect place = GetPlace();
  const Size screen = TheApp().Screen().GetSize();
  const Point to{
      std::clamp(place.left + by.x, kGripWidth - place.Width(), screen.width - kGripWidth),
      std::clamp(place.top + by.y, 0, screen.height - kBorder - kCaptionHeight)};
  SetPlace(RectAt(to, {place.Width(), place.Height()}));
  TheApp().Screen().MarkStale();
}

}  // namespace platform
