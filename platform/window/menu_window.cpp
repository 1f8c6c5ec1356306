#include "platform/window/menu_window.h"

#include <algorithm>
#include <cctype>
#include <utility>

#include "platform/draw/look.h"
#include "platform/window/application.h"
#include "platform/window/frame_window.h"

namespace platform {
namespace {

constexpr int kLineHeight = 20;
constexpr int kSeparatorHeight = 7;
constexpr int kIndent = 12;
constexpr int kEdge = 2;
constexpr int kKeyGap = 24;  ///< at least, between an item and its key

int HeightOf(const MenuItem& item) { return item.commandID == 0 ? kSeparatorHeight : kLineHeight; }

int WidthOf(const MenuItem& item) {
  const int width = MeasureText(kSystemFont, WithoutMnemonic(item.text)).width;
  const std::string key = TheApp().MainFrame()->KeyOf(item.commandID);
  return key.empty() ? width : width + kKeyGap + MeasureText(kSystemFont, key).width;
}

}  // namespace

char LetterOf(const std::string& itemText) {
  if (const char marked = MnemonicOf(itemText); marked != 0 || itemText.empty()) return marked;
  return static_cast<char>(std::toupper(static_cast<unsigned char>(itemText[0])));
}

Rect CMenuWindow::PlaceOf(const MenuTemplate& menu, Point at) {
  Size size{0, 2 * kEdge};
  for (const MenuItem& item : menu.items) {
    size.width = std::max(size.width, WidthOf(item) + 2 * (kIndent + kEdge));
    size.height += HeightOf(item);
  }
  return RectAt(at, size);
}

CMenuWindow::CMenuWindow(const MenuTemplate& menu, Point at, std::function<void()> onClosed)
    : CTopWindow(WithoutMnemonic(menu.title), PlaceOf(menu, at), Kind::kPopup),
      m_fnClosed(std::move(onClosed)) {
  int y = kEdge;
  for (const MenuItem& item : menu.items) {
    const Rect place{kEdge, y, GetPlace().Width() - kEdge, y + HeightOf(item)};
    CFrameWindow& frame = *TheApp().MainFrame();
    m_arrLines.push_back(
        {item, frame.KeyOf(item.commandID), place, frame.IsCommandEnabled(item.commandID)});
    y = place.bottom;
  }
}

Phrases CMenuWindow::Words() const {
  const std::string title = GetTitle() + " menu";
  if (m_nSelected < 0) return {title};
  const Line& line = m_arrLines[static_cast<std::size_t>(m_nSelected)];
  return {title, WithoutMnemonic(line.item.text) + (line.key.empty() ? "" : ", " + line.key) +
                     (line.enabled ? "" : ", not now")};
}

void CMenuWindow::OnPaint(CSurface& surface) {
  DrawButtonFace(surface, surface.Bounds(), false);
  for (std::size_t i = 0; i < m_arrLines.size(); ++i) DrawLine(surface, i);
}

void CMenuWindow::DrawLine(CSurface& surface, std::size_t index) const {
  const Line& line = m_arrLines[index];
  if (line.item.commandID == 0) {
    const int y = line.place.top + kSeparatorHeight / 2;
    surface.FillRect({line.place.left + 2, y, line.place.right - 2, y + 1}, kShadowEdge);
    surface.FillRect({line.place.left + 2, y + 1, line.place.right - 2, y + 2}, kLightEdge);
    return;
  }
  const bool selected = static_cast<int>(index) == m_nSelected;
  if (selected) surface.FillRect(line.place, line.enabled ? kHighlight : kPressedColor);
  const Color color = !line.enabled ? kDisabledText : selected ? kWhite : kBlack;
  const int y = line.place.top + (kLineHeight - kSystemFont.height) / 2;
  DrawMnemonicText(surface, {line.place.left + kIndent, y}, line.item.text, color);
  const int keyWidth = MeasureText(kSystemFont, line.key).width;
  DrawMnemonicText(surface, {line.place.right - kIndent - keyWidth, y}, line.key, color);
}

int CMenuWindow::LineAt(Point p) const {
  for (std::size_t i = 0; i < m_arrLines.size(); ++i) {
    if (m_arrLines[i].place.Contains(p) && m_arrLines[i].item.commandID != 0) {
      return static_cast<int>(i);
    }
  }
  return -1;
}

void CMenuWindow::Select(int line) {
  if (m_nSelected == line) return;
  m_nSelected = line;
  Invalidate();
}

void CMenuWindow::Step(int direction) {
  const int count = static_cast<int>(m_arrLines.size());
  int line = m_nSelected < 0 && direction < 0 ? 0 : m_nSelected;
  do {
    line = (line + direction + count) % count;
  } while (m_arrLines[static_cast<std::size_t>(line)].item.commandID == 0);
  Select(line);
}

void CMenuWindow::OnLButtonUp(Point p) {
  if (const int line = LineAt(p); line >= 0) Choose(line);
}

/// A mouse that stays on a line leaves the highlight to the keys.
void CMenuWindow::OnMouseHover(Point p) {
  if (const int line = LineAt(p); std::exchange(m_nHovered, line) != line) Select(line);
}

bool CMenuWindow::OnKeyDown(const KeyStroke& stroke) {
  switch (stroke.key) {
    case Key::kUp:
      Step(-1);
      break;
    case Key::kDown:
      Step(1);
      break;
    case Key::kEnter:
      if (m_nSelected >= 0) Choose(m_nSelected);
      break;
    case Key::kEscape:
    case Key::kF10:
      Dismiss();
      break;
    case Key::kCharacter:
      return ChooseByLetter(stroke.character);
    default:
      return false;
  }
  return true;
}

/// Chooses the only item that a letter stands for; of several, moves on to the next.
bool CMenuWindow::ChooseByLetter(char letter) {
  const int count = static_cast<int>(m_arrLines.size());
  std::vector<int> matches;
  for (int i = 1; i <= count; ++i) {
    const int line = (m_nSelected + i + count) % count;
    const Line& at = m_arrLines[static_cast<std::size_t>(line)];
    if (letter != 0 && at.enabled && LetterOf(at.item.text) == letter) matches.push_back(line);
  }
  if (matches.empty()) return false;
  Select(matches.front());
  if (matches.size() == 1) Choose(matches.front());
  return true;
}

void CMenuWindow::Choose(int line) {
  const Line& chosen = m_arrLines[static_cast<std::size_t>(line)];
  if (!chosen.enabled) return;
  TheApp().Queue().PostCommand(chosen.item.commandID);
  Dismiss();
}

void CMenuWindow::Dismiss() {
  Close();
  m_fnClosed();
}

}  // namespace platform
