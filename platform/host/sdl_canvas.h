#pragma once

#include <SDL.h>

#include <memory>

namespace platform {

/// The pixels of a desktop window, to be drawn anew as a whole each time.
class SdlCanvas {
 public:
  /// The hints that a window needs before it is made. Plain is quickest and smallest: pixels in
  /// memory, handed to the desktop as they are. Displays without such a path take what SDL thinks
  /// best.
  static void Prepare(bool plain);
  /// Answers whether the window, which must outlive this, can be drawn on so.
  bool Open(SDL_Window* window, bool plain);
  /// Before the window goes.
  void Close() { m_pRenderer.reset(); }

  /// What to draw on, in the format that it has, as large as the window in pixels of the display;
  /// null where it cannot be had now. End shows it.
  SDL_Surface* Begin();
  void End();

 private:
  /// Gives back what SDL has made.
  struct Gone {
    void operator()(SDL_Renderer* renderer) const { SDL_DestroyRenderer(renderer); }
    void operator()(SDL_Texture* texture) const { SDL_DestroyTexture(texture); }
    void operator()(SDL_Surface* surface) const { SDL_FreeSurface(surface); }
  };

  SDL_Window* m_pWindow = nullptr;
  // Where the display is not plain.
  std::unique_ptr<SDL_Renderer, Gone> m_pRenderer;
  std::unique_ptr<SDL_Surface, Gone> m_pPicture;
};

}  // namespace platform
