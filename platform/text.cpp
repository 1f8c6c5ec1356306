#include "platform/text.h"

#include <SDL_ttf.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdlib>
#include <memory>

#include "platform/embedded.h"
#include "platform/utf8.h"

namespace platform {
namespace {

/// The point sizes at which the hinted face is exactly so many pixels high (measured).
struct FaceSize {
  int cellHeight;
  int points;
};
constexpr std::array<FaceSize, 5> kFaceSizes = {{{11, 9}, {13, 11}, {14, 12}, {15, 13}, {22, 19}}};

/// At this height the bold face looks like the normal one, so bold is the normal face struck twice.
constexpr int kStruckTwiceHeight = 11;

std::size_t NearestFace(int height) {
  const auto nearest =
      std::min_element(kFaceSizes.begin(), kFaceSizes.end(), [height](FaceSize a, FaceSize b) {
        return std::abs(a.cellHeight - height) < std::abs(b.cellHeight - height);
      });
  return static_cast<std::size_t>(nearest - kFaceSizes.begin());
}

/// The opened faces, each read once at its first use.
class FaceCache {
 public:
  FaceCache() { TTF_Init(); }
  ~FaceCache() {
    for (TTF_Font* face : m_arrFaces) {
      if (face != nullptr) TTF_CloseFont(face);
    }
    TTF_Quit();
  }
  FaceCache(const FaceCache&) = delete;
  FaceCache& operator=(const FaceCache&) = delete;

  TTF_Font* Face(std::size_t size, bool bold) {
    TTF_Font*& face = m_arrFaces[size * 2 + (bold ? 1 : 0)];
    if (face == nullptr) face = Open(size, bold);
    return face;
  }

 private:
  static TTF_Font* Open(std::size_t size, bool bold) {
    const EmbeddedFile* file =
        FindEmbedded(FontFiles(), bold ? "LiberationSans-Bold.ttf" : "LiberationSans-Regular.ttf");
    if (file == nullptr) return nullptr;
    SDL_RWops* data = SDL_RWFromConstMem(file->data, static_cast<int>(file->size));
    TTF_Font* face = TTF_OpenFontRW(data, 1, kFaceSizes[size].points);
    if (face != nullptr) TTF_SetFontHinting(face, TTF_HINTING_MONO);
    return face;
  }

  std::array<TTF_Font*, kFaceSizes.size() * 2> m_arrFaces{};
};

/// A face as it is asked for: which opened face, and whether it is struck twice.
struct ChosenFace {
  TTF_Font* face;
  int cellHeight;
  bool struckTwice;
};

ChosenFace Choose(const Font& font) {
  static FaceCache cache;
  const std::size_t size = NearestFace(font.height);
  const int height = kFaceSizes[size].cellHeight;
  const bool twice = font.bold && height == kStruckTwiceHeight;
  return {cache.Face(size, font.bold && !twice), height, twice};
}

using SurfacePtr = std::unique_ptr<SDL_Surface, decltype(&SDL_FreeSurface)>;

void Strike(const SDL_Surface& glyphs, int shift, CBitmap& stencil) {
  const int height = std::min(glyphs.h, stencil.GetSize().height);
  const int width = std::min(glyphs.w, stencil.GetSize().width - shift);
  for (int y = 0; y < height; ++y) {
    const auto offset = static_cast<std::ptrdiff_t>(y) * glyphs.pitch;
    const auto* row = static_cast<const Uint8*>(glyphs.pixels) + offset;
    for (int x = 0; x < width; ++x) {
      if (row[x] != 0) stencil.At({x + shift, y}) = ToPixel(kBlack);
    }
  }
}

/// The letters of a text, each with its own width and the extra pixel that striking it twice takes.
template <class LetterRule>
void EachLetter(TTF_Font* face, const std::string& text, LetterRule rule) {
  int left = 0;
  for (std::size_t at = 0; at < text.size();) {
    const std::size_t next = NextLetter(text, at);
    const std::string letter = text.substr(at, next - at);
    int width = 0;
    TTF_SizeUTF8(face, letter.c_str(), &width, nullptr);
    rule(letter, left);
    left += width + 1;
    at = next;
  }
  rule("", left);
}

SurfacePtr Render(TTF_Font* face, const std::string& text) {
  return {TTF_RenderUTF8_Solid(face, text.c_str(), SDL_Color{}), &SDL_FreeSurface};
}

}  // namespace

Size MeasureText(const Font& font, const std::string& text) {
  const ChosenFace chosen = Choose(font);
  int width = 0;
  if (!text.empty() && chosen.face != nullptr) {
    if (chosen.struckTwice) {
      EachLetter(chosen.face, text, [&width](const std::string&, int left) { width = left; });
    } else {
      TTF_SizeUTF8(chosen.face, text.c_str(), &width, nullptr);
    }
  }
  return {width, chosen.cellHeight};
}

std::size_t FittingLength(const Font& font, const std::string& text, int width) {
  const ChosenFace chosen = Choose(font);
  int extent = 0;
  int letters = 0;
  if (chosen.face == nullptr || text.empty() || width <= 0) return 0;
  TTF_MeasureUTF8(chosen.face, text.c_str(), width, &extent, &letters);
  std::size_t at = 0;
  for (int i = 0; i < letters; ++i) at = NextLetter(text, at);
  return at;
}

CBitmap RenderText(const Font& font, const std::string& text) {
  const ChosenFace chosen = Choose(font);
  CBitmap stencil = CBitmap::SeeThrough(MeasureText(font, text));
  if (text.empty() || chosen.face == nullptr) return stencil;
  if (!chosen.struckTwice) {
    if (const SurfacePtr glyphs = Render(chosen.face, text)) Strike(*glyphs, 0, stencil);
    return stencil;
  }
  EachLetter(chosen.face, text, [&](const std::string& letter, int left) {
    const SurfacePtr glyph = Render(chosen.face, letter);
    if (glyph == nullptr) return;
    Strike(*glyph, left, stencil);
    Strike(*glyph, left + 1, stencil);
  });
  return stencil;
}

}  // namespace platform
