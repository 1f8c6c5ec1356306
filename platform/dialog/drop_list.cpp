#include "platform/dialog/drop_list.h"

#include <algorithm>
#include <cctype>
#include <utility>

#include "platform/draw/look.h"
#include "platform/window/application.h"

namespace platform {
namespace {
constexpr int kRowHeight = 15;
}  // namespace

int NextItemByLetter(const std::vector<std::string>& items, int from, char letter) {
  const int count = static_cast<int>(items.size());
  for (int i = 0; i < count; ++i) {
    const int item = (from + i) % count;
    const std::string& text = items[static_cast<std::size_t>(item)];
    if (letter != 0 && !text.empty() &&
        std::toupper(static_cast<unsigned char>(text[0])) == letter) {
      return item;
    }
  }
  return -1;
}

Rect CDropList::PlaceFor(std::size_t items, const Rect& line) {
  const int height = static_cast<int>(items) * kRowHeight + 2;
  const int room = std::max(0, TheApp().Screen().GetSize().height - height);
  const int top = line.bottom <= room ? line.bottom : std::clamp(line.top - height, 0, room);
  return {line.left, top, line.right, top + height};
}

CDropList::CDropList(const std::vector<std::string>& items, int chosen, const Rect& line,
                     std::function<void(int item)> onChosen)
    : CTopWindow("", PlaceFor(items.size(), line), Kind::kPopup),
      m_arrItems(items),
      m_nHighlighted(chosen),
      m_fnChosen(std::move(onChosen)) {}

Phrases CDropList::Words() const {
  const std::string count = std::to_string(m_arrItems.size());
  if (m_nHighlighted < 0) return {"List of " + count};
  return {std::to_string(m_nHighlighted + 1) + " of " + count + ", " +
          m_arrItems[static_cast<std::size_t>(m_nHighlighted)]};
}

void CDropList::OnPaint(CSurface& surface) {
  surface.SetPen(kBlack);
  surface.SetBrush(kWhite);
  surface.Rectangle(GetClientRect());
  for (std::size_t i = 0; i < m_arrItems.size(); ++i) {
    const int top = 1 + static_cast<int>(i) * kRowHeight;
    const bool highlighted = static_cast<int>(i) == m_nHighlighted;
    if (highlighted) {
      surface.FillRect({1, top, GetClientRect().right - 1, top + kRowHeight}, kHighlight);
    }
    surface.SetFont(kSystemFont);
    surface.SetBackMode(BackMode::kTransparent);
    surface.SetTextColor(highlighted ? kWhite : kBlack);
    surface.TextOut({4, top + 1}, m_arrItems[i]);
  }
}

int CDropList::ItemAt(Point p) const {
  const Rect items{1, 1, GetClientRect().right - 1, GetClientRect().bottom - 1};
  return items.Contains(p) ? (p.y - 1) / kRowHeight : -1;
}

void CDropList::OnMouseMove(Point p) {
  if (const int item = ItemAt(p); item >= 0) Highlight(item);
}

void CDropList::OnLButtonUp(Point p) {
  if (const int item = ItemAt(p); item >= 0) {
    Highlight(item);
    Choose();
  }
}

/// A mouse that stays on an item leaves the highlight to the keys.
void CDropList::OnMouseHover(Point p) {
  if (const int item = ItemAt(p); std::exchange(m_nHovered, item) != item) OnMouseMove(p);
}

void CDropList::Highlight(int item) {
  m_nHighlighted = item;
  Invalidate();
}

void CDropList::Step(int items) {
  const int count = static_cast<int>(m_arrItems.size());
  if (count > 0) Highlight(std::clamp(m_nHighlighted + items, 0, count - 1));
}

void CDropList::Choose() {
  Close();
  if (m_nHighlighted >= 0) m_fnChosen(m_nHighlighted);
}

bool CDropList::OnKeyDown(const KeyStroke& stroke) {
  const int count = static_cast<int>(m_arrItems.size());
  switch (stroke.key) {
    case Key::kUp:
      Step(-1);
      break;
    case Key::kDown:
      Step(1);
      break;
    case Key::kHome:
    case Key::kPageUp:
      Step(-count);
      break;
    case Key::kEnd:
    case Key::kPageDown:
      Step(count);
      break;
    case Key::kEnter:
    case Key::kTab:
    case Key::kF4:
      Choose();
      break;
    case Key::kEscape:
      Close();
      break;
    case Key::kCharacter:
      if (stroke.character == ' ') {
        Choose();
      } else if (const int item =
                     NextItemByLetter(m_arrItems, m_nHighlighted + 1, stroke.character);
                 item >= 0) {
        Highlight(item);
      }
      break;
    default:
      return false;
  }
  return true;
}

}  // namespace platform
