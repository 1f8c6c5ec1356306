#include "platform/dialog/edit_box.h"

#include <algorithm>
#include <cstdlib>

#include "platform/dialog/dialog.h"
#include "platform/draw/look.h"
#include "platform/draw/utf8.h"
#include "platform/host/host.h"

namespace platform {
namespace {

constexpr int kPadding = 4;

void DrawBox(CSurface& surface, Color fill) {
  surface.SetPen(kBlack);
  surface.SetBrush(fill);
  surface.Rectangle(surface.Bounds());
}

int TextTop(const Rect& client) { return (client.bottom - kSystemFont.height) / 2; }

}  // namespace

std::string CEditBox::Words(const std::string& label) const {
  return label + " text, " + (GetText().empty() ? "empty" : GetText());
}

void CEditBox::SetText(const std::string& text) {
  CControl::SetText(OneLine(text));
  m_nCaret = m_nAnchor = GetText().size();
  ScrollToCaret();
}

std::size_t CEditBox::SelectionStart() const { return std::min(m_nCaret, m_nAnchor); }
std::size_t CEditBox::SelectionEnd() const { return std::max(m_nCaret, m_nAnchor); }
std::string CEditBox::Selected() const {
  return GetText().substr(SelectionStart(), SelectionEnd() - SelectionStart());
}

std::string CEditBox::Shown() const {
  std::string shown = GetText();
  return shown.insert(m_nCaret, m_strComposition);
}

int CEditBox::CaretX(std::size_t at) const {
  return kPadding - m_nScroll + MeasureText(kSystemFont, Shown().substr(0, at)).width;
}

void CEditBox::OnPaint(CSurface& surface) {
  const Rect client = GetClientRect();
  DrawBox(surface, kWhite);
  // What is drawn within the border must not run over it.
  CBitmap pixels({client.right, client.bottom}, kWhite);
  CSurface inside(pixels);
  DrawShown(inside);
  surface.BitBlt({1, 1}, {client.right - 2, client.bottom - 2}, pixels, {1, 1});
}

void CEditBox::DrawShown(CSurface& inside) {
  const int top = TextTop(GetClientRect());
  const int bottom = top + kSystemFont.height;
  // Of a long text only the piece around the box is drawn.
  const std::size_t from = FittingLength(kSystemFont, Shown(), m_nScroll - kPadding);
  std::string piece = Shown().substr(from);
  piece.resize(FittingLength(kSystemFont, piece, 2 * GetClientRect().right));
  const CBitmap stencil = RenderText(kSystemFont, piece);
  // Its first letter may stand closer to the one before it than at the start of a text.
  const Point at{CaretX(from + piece.size()) - stencil.GetSize().width, top};
  inside.DrawStencil(at, stencil, kBlack);
  if (!HasFocus()) return;
  if (m_nCaret != m_nAnchor) {
    // A pixel more on every side, so that no light letter touches the light box.
    const Rect marked =
        Rect{CaretX(SelectionStart()), top, CaretX(SelectionEnd()), bottom}.Shrunk(-1).Intersection(
            inside.Bounds());
    inside.FillRect(marked, kHighlight);
    CSurface(inside, marked).DrawStencil(at - marked.TopLeft(), stencil, kWhite);
  }
  const int caret = CaretX(CompositionEnd());
  inside.FillRect({caret - 1, top - 1, caret, bottom + 1}, kBlack);
  inside.FillRect({CaretX(m_nCaret), bottom, caret, bottom + 1}, kBlack);
}

std::size_t CEditBox::PlaceAt(int x) const {
  const std::size_t before = FittingLength(kSystemFont, GetText(), x - CaretX(0));
  const std::size_t after = NextLetter(GetText(), before);
  return std::abs(CaretX(after) - x) < std::abs(CaretX(before) - x) ? after : before;
}

void CEditBox::OnLButtonDown(Point p) {
  TakeFocus();
  PointAt(p, false);
}

void CEditBox::OnMiddleClick(Point p, const std::string& text) {
  OnLButtonDown(p);
  if (m_strComposition.empty()) Insert(text);
}

/// What is being composed stays where it is.
void CEditBox::PointAt(Point p, bool select) {
  if (m_strComposition.empty()) MoveCaret(PlaceAt(p.x), select);
}

void CEditBox::MoveCaret(std::size_t to, bool select) {
  m_nCaret = to;
  if (!select) m_nAnchor = to;
  ScrollToCaret();
}

void CEditBox::ScrollToCaret() {
  const int left = kPadding;
  const int right = GetClientRect().right - kPadding;
  const int x = CaretX(CompositionEnd());
  if (x < left) m_nScroll -= left - x;
  if (x > right) m_nScroll += x - right;
  // No blank room at the end while letters are hidden at the start.
  const int width = MeasureText(kSystemFont, Shown()).width;
  m_nScroll = std::clamp(m_nScroll, 0, std::max(0, width - (right - left)));
  if (HasFocus()) PlaceTextInput();
  Invalidate();
}

void CEditBox::PlaceTextInput() {
  const Rect client = GetClientRect();
  const Rect text{CaretX(m_nCaret) - 1, 0, CaretX(CompositionEnd()), client.bottom};
  TheHost().SetTextInput(text.Intersection(client).Moved(ScreenOrigin()));
}

void CEditBox::Insert(const std::string& text) {
  std::string whole = GetText();
  const std::string line = OneLine(text);
  const std::size_t start = SelectionStart();
  whole.replace(start, SelectionEnd() - start, line);
  CControl::SetText(whole);
  MoveCaret(start + line.size(), false);
}

void CEditBox::Erase(bool forwards) {
  if (m_nCaret == m_nAnchor) {
    m_nAnchor = forwards ? NextLetter(GetText(), m_nCaret) : PreviousLetter(GetText(), m_nCaret);
  }
  Insert("");
}

bool CEditBox::OnKeyDown(const KeyStroke& stroke) {
  if (stroke.alt) return false;
  if (OnMoveKey(stroke) || OnClipboardKey(stroke)) return true;
  if (stroke.key == Key::kBackspace || stroke.key == Key::kDelete) {
    Erase(stroke.key == Key::kDelete);
    return true;
  }
  return false;
}

bool CEditBox::OnMoveKey(const KeyStroke& stroke) {
  const bool leavesSelection = m_nCaret != m_nAnchor && !stroke.shift;
  switch (stroke.key) {
    case Key::kLeft:
      MoveCaret(leavesSelection ? SelectionStart() : PreviousLetter(GetText(), m_nCaret),
                stroke.shift);
      return true;
    case Key::kRight:
      MoveCaret(leavesSelection ? SelectionEnd() : NextLetter(GetText(), m_nCaret), stroke.shift);
      return true;
    case Key::kHome:
      MoveCaret(0, stroke.shift);
      return true;
    case Key::kEnd:
      MoveCaret(GetText().size(), stroke.shift);
      return true;
    default:
      return false;
  }
}

bool CEditBox::OnClipboardKey(const KeyStroke& stroke) {
  const auto ctrl = [&stroke](char letter) { return stroke.ctrl && stroke.character == letter; };
  const bool cut = ctrl('X') || (stroke.shift && stroke.key == Key::kDelete);
  const bool copy = ctrl('C') || (stroke.ctrl && stroke.key == Key::kInsert);
  const bool paste = ctrl('V') || (stroke.shift && stroke.key == Key::kInsert);
  if ((cut || copy) && m_nCaret != m_nAnchor) TheHost().SetClipboard(Selected());
  if (cut && m_nCaret != m_nAnchor) Insert("");
  if (paste) Insert(TheHost().GetClipboard());
  if (ctrl('A')) {
    m_nAnchor = 0;
    MoveCaret(GetText().size(), true);
  }
  return cut || copy || paste || ctrl('A');
}

bool CEditBox::OnChar(const std::string& text) {
  m_strComposition.clear();
  Insert(text);
  return true;
}

bool CEditBox::OnComposition(const std::string& text) {
  // An input method that only goes away says so with nothing.
  if (!text.empty() && m_nCaret != m_nAnchor) Insert("");
  m_strComposition = OneLine(text);
  ScrollToCaret();
  return true;
}

void CEditBox::OnFocus(bool focused) {
  m_strComposition.clear();
  if (focused) {
    PlaceTextInput();
  } else {
    TheHost().SetTextInput(std::nullopt);
  }
  Invalidate();
}

void CNumberBox::OnPaint(CSurface& surface) {
  DrawBox(surface, kFaceColor);
  const Rect client = GetClientRect();
  surface.SetFont(kSystemFont);
  surface.SetBackMode(BackMode::kTransparent);
  surface.DrawText({kPadding, TextTop(client), client.right - kPadding, client.bottom}, GetText(),
                   TextAlign::kRight);
}

}  // namespace platform
