#include "bench/sdl_frame.h"

#include <algorithm>
#include <cstring>

#include "platform/draw/resources.h"
#include "platform/draw/utf8.h"
#include "shell/res/pictures.h"

namespace feltside::bench {
namespace {

using platform::CBitmap;
using platform::Point;

constexpr int kWidth = 240;
constexpr int kHeight = 268;
constexpr Uint32 kSeeThrough = 0x00FF00FF;  // no pixel of the game

Surface NewSurface(int width, int height) {
  return Surface(SDL_CreateRGBSurfaceWithFormat(0, width, height, 32, SDL_PIXELFORMAT_RGB888));
}

Uint32& PixelOf(SDL_Surface& surface, Point at) {
  auto* line = static_cast<Uint8*>(surface.pixels) + std::ptrdiff_t{surface.pitch} * at.y;
  return reinterpret_cast<Uint32*>(line)[at.x];
}

/// The opaque pixels of a bitmap, in their own colours; the others are not drawn.
Surface SurfaceOf(const CBitmap& bitmap) {
  Surface surface = NewSurface(bitmap.GetSize().width, bitmap.GetSize().height);
  bool whole = true;
  for (int y = 0; y < surface->h; ++y) {
    for (int x = 0; x < surface->w; ++x) {
      const bool opaque = platform::IsOpaque(bitmap.At({x, y}));
      PixelOf(*surface, {x, y}) = opaque ? bitmap.At({x, y}) & 0xFFFFFF : kSeeThrough;
      whole = whole && opaque;
    }
  }
  if (!whole) SDL_SetColorKey(surface.get(), SDL_TRUE, kSeeThrough);
  return surface;
}

/// What a text has more than its beginning, from its first column with ink on, which is told.
CBitmap LastLetter(const CBitmap& text, const CBitmap& beginning, int& column) {
  CBitmap letter = text;
  column = text.GetSize().width;
  for (int y = 0; y < text.GetSize().height; ++y) {
    for (int x = text.GetSize().width - 1; x >= 0; --x) {
      const Point p{x, y};
      if (beginning.Bounds().Contains(p) && platform::IsOpaque(beginning.At(p))) letter.At(p) = 0;
      if (platform::IsOpaque(letter.At(p))) column = std::min(column, x);
    }
  }
  CBitmap part = CBitmap::SeeThrough({text.GetSize().width - column, text.GetSize().height});
  platform::CSurface(part).DrawIcon({-column, 0}, letter);
  return part;
}

CBitmap Colored(const CBitmap& stencil, platform::Color color) {
  CBitmap letter = CBitmap::SeeThrough(stencil.GetSize());
  platform::CSurface(letter).DrawStencil({}, stencil, color);
  return letter;
}

}  // namespace

CSdlFrame::CSdlFrame(const Phase& phase)
    : m_fills(phase.fills), m_window(NewSurface(kWidth, kHeight)) {
  for (const PlacedPicture& picture : phase.ground) Add(m_ground, picture);
  for (const PlacedPicture& picture : phase.pictures) Add(m_blits, picture);
  for (const PlacedText& text : phase.texts) AddLetters(text);
}

void CSdlFrame::Add(std::vector<Blit>& blits, const PlacedPicture& picture) {
  platform::CResources pictures(PictureFiles());
  const CBitmap& bitmap = picture.icon ? pictures.LoadIcon(picture.number, {})
                                       : pictures.LoadBitmap(picture.number, {});
  blits.push_back({SurfaceOf(bitmap), picture.at});
}

void CSdlFrame::AddLetters(const PlacedText& text) {
  CBitmap before;
  for (std::size_t end = 0; end < text.text.size();) {
    end = platform::NextLetter(text.text, end);
    const CBitmap now = platform::RenderText(text.font, text.text.substr(0, end));
    int column = 0;
    const CBitmap letter = LastLetter(now, before, column);
    before = now;
    if (letter.GetSize().width == 0) continue;  // a blank
    m_blits.push_back({SurfaceOf(Colored(letter, text.color)), text.at + Point{column, 0}});
  }
}

void CSdlFrame::Draw() const {
  const Surface frame = NewSurface(kWidth, kHeight);
  const auto lay = [&frame](const Blit& blit) {
    SDL_Rect at{blit.at.x, blit.at.y, 0, 0};
    SDL_BlitSurface(blit.source.get(), nullptr, frame.get(), &at);
  };
  if (!m_ground.empty()) SDL_FillRect(frame.get(), nullptr, SDL_MapRGB(frame->format, 0, 155, 0));
  std::for_each(m_ground.begin(), m_ground.end(), lay);
  for (const PlacedFill& fill : m_fills) {
    const SDL_Rect rect{fill.rect.left, fill.rect.top, fill.rect.Width(), fill.rect.Height()};
    SDL_FillRect(frame.get(), &rect, platform::ToPixel(fill.color));
  }
  std::for_each(m_blits.begin(), m_blits.end(), lay);
  SDL_BlitSurface(frame.get(), nullptr, m_window.get(), nullptr);
}

CBitmap CSdlFrame::Shown() const {
  CBitmap shown({kWidth, kHeight});
  for (int y = 0; y < kHeight; ++y) {
    for (int x = 0; x < kWidth; ++x) shown.At({x, y}) = 0xFF000000U | PixelOf(*m_window, {x, y});
  }
  return shown;
}

}  // namespace feltside::bench
