#pragma once

#include <SDL_surface.h>

#include <memory>
#include <vector>

#include "bench/phases.h"

namespace feltside::bench {

struct FreeSurface {
  void operator()(SDL_Surface* surface) const { SDL_FreeSurface(surface); }
};
using Surface = std::unique_ptr<SDL_Surface, FreeSurface>;

/// The same screen drawn straight on SDL's surfaces, as one would who knows beforehand all that is
/// to be drawn: every picture and every letter is a surface by then, and only laid in its place.
class CSdlFrame {
 public:
  explicit CSdlFrame(const Phase& phase);

  /// Composes a whole frame off screen and puts it on the window's surface in one transfer.
  void Draw() const;
  platform::CBitmap Shown() const;

 private:
  struct Blit {
    Surface source;
    platform::Point at;
  };
  void Add(std::vector<Blit>& blits, const PlacedPicture& picture);
  void AddLetters(const PlacedText& text);

  std::vector<Blit> m_ground;
  std::vector<PlacedFill> m_fills;
  std::vector<Blit> m_blits;
  Surface m_window;
};

}  // namespace feltside::bench
