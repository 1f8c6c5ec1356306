#include "platform/draw/look.h"

#include <cctype>

namespace platform {
namespace {

/// A text taken apart at its mnemonic sign.
struct MnemonicText {
  std::string before;
  std::string letter;  ///< empty where no letter is marked
  std::string after;
};

MnemonicText TakeApart(const std::string& text) {
  MnemonicText parts;
  std::string* to = &parts.before;
  for (std::size_t i = 0; i < text.size(); ++i) {
    if (text[i] != '&') {
      *to += text[i];
    } else if (i + 1 < text.size()) {
      ++i;
      if (text[i] == '&' || !parts.letter.empty()) {
        *to += text[i];
      } else {
        parts.letter = text[i];
        to = &parts.after;
      }
    }
  }
  return parts;
}

}  // namespace

void DrawButtonFace(CSurface& surface, const Rect& rect, bool pressed) {
  surface.FillRect(rect, pressed ? kLightEdge : kShadowEdge);
  surface.FillRect({rect.left, rect.top, rect.right - 1, rect.bottom - 1},
                   pressed ? kShadowEdge : kLightEdge);
  surface.FillRect(rect.Shrunk(1), pressed ? kPressedColor : kFaceColor);
}

void DrawCross(CSurface& surface, const Rect& button) {
  const Point middle{(button.left + button.right) / 2 - 1, (button.top + button.bottom) / 2 - 1};
  for (int i = -3; i <= 3; ++i) {
    surface.FillRect(RectAt(middle + Point{i, i}, {2, 1}), kBlack);
    surface.FillRect(RectAt(middle + Point{i, -i}, {2, 1}), kBlack);
  }
}

void DrawFocusRect(CSurface& surface, const Rect& rect) {
  const auto dot = [&surface](int x, int y) {
    if ((x + y) % 2 == 0) surface.FillRect({x, y, x + 1, y + 1}, kBlack);
  };
  for (int x = rect.left; x < rect.right; ++x) {
    dot(x, rect.top);
    dot(x, rect.bottom - 1);
  }
  for (int y = rect.top; y < rect.bottom; ++y) {
    dot(rect.left, y);
    dot(rect.right - 1, y);
  }
}

void DrawMnemonicText(CSurface& surface, Point at, const std::string& text, Color color) {
  const SavedState saved(surface);
  surface.SetFont(kSystemFont);
  surface.SetBackMode(BackMode::kTransparent);
  surface.SetTextColor(color);
  const MnemonicText parts = TakeApart(text);
  surface.TextOut(at, parts.before + parts.letter + parts.after);
  if (parts.letter.empty()) return;
  const int left = at.x + surface.TextExtent(parts.before).width;
  const int right = at.x + surface.TextExtent(parts.before + parts.letter).width;
  const int baseline = at.y + kSystemFont.height - 2;
  surface.FillRect({left, baseline, right, baseline + 1}, color);
}

std::string WithoutMnemonic(const std::string& text) {
  const MnemonicText parts = TakeApart(text);
  return parts.before + parts.letter + parts.after;
}

char MnemonicOf(const std::string& text) {
  const std::string letter = TakeApart(text).letter;
  return letter.empty() ? '\0'
                        : static_cast<char>(std::toupper(static_cast<unsigned char>(letter[0])));
}

CBitmap Greyed(const CBitmap& picture) {
  CBitmap greyed = CBitmap::SeeThrough(picture.GetSize());
  for (int y = 0; y < picture.GetSize().height; ++y) {
    for (int x = 0; x < picture.GetSize().width; ++x) {
      const Pixel pixel = picture.At({x, y});
      const bool dark = IsOpaque(pixel) && ToColor(pixel) != kWhite;
      if (dark) greyed.At({x, y}) = ToPixel(kDisabledSign);
    }
  }
  return greyed;
}

}  // namespace platform
