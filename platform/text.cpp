#include "platform/text.h"

#include <SDL_ttf.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdlib>
#include <memory>

#include "platform/embedded.h"

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

}  // namespace

Size MeasureText(const Font& font, const std::string& text) {
  const ChosenFace chosen = Choose(font);
  int width = 0;
  int height = 0;
  if (!text.empty() && chosen.face != nullptr) {
    TTF_SizeUTF8(chosen.face, text.c_str(), &width, &height);
    if (chosen.struckTwice) ++width;
  }
  return {width, chosen.cellHeight};
}

CBitmap RenderText(const Font& font, const std::string& text) {
  const ChosenFace chosen = Choose(font);
  CBitmap stencil = CBitmap::SeeThrough(MeasureText(font, text));
  if (text.empty() || chosen.face == nullptr) return stencil;
  const SurfacePtr glyphs(TTF_RenderUTF8_Solid(chosen.face, text.c_str(), SDL_Color{}),
                          &SDL_FreeSurface);
  if (glyphs == nullptr) return stencil;
  Strike(*glyphs, 0, stencil);
  if (chosen.struckTwice) Strike(*glyphs, 1, stencil);
  return stencil;
}

}  // namespace platform
