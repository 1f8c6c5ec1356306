#pragma once

#include <SDL.h>

namespace platform {

/// The pixels of a desktop window, to be drawn anew as a whole each time.
class SdlCanvas {
 public:
  SdlCanvas() = default;
  ~SdlCanvas() { Close(); }
  SdlCanvas(const SdlCanvas&) = delete;
  SdlCanvas& operator=(const SdlCanvas&) = delete;

  /// The hints that a window needs before it is made. Plain is quickest and smallest: pixels in
  /// memory, handed to the desktop as they are. Displays without such a path take what SDL thinks
  /// best.
  static void Prepare(bool plain);
  /// Answers whether the window, which must outlive this, can be drawn on so.
  bool Open(SDL_Window* window, bool plain);
  void Close();

  /// What to draw on, in the format that it has, as large as the window in pixels of the display;
  /// null where it cannot be had now. End shows it.
  SDL_Surface* Begin();
  void End();

 private:
  SDL_Surface* LockTexture();

  SDL_Window* m_pWindow = nullptr;
  // Where the display is not plain.
  SDL_Renderer* m_pRenderer = nullptr;
  SDL_Texture* m_pTexture = nullptr;
};

}  // namespace platform
