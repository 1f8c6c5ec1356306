#include "platform/host/sdl_canvas.h"

namespace platform {

void SdlCanvas::Prepare(bool plain) {
  if (plain) {
    SDL_SetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0");
  } else {
    SDL_ResetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION);
  }
}

bool SdlCanvas::Open(SDL_Window* window, bool plain) {
  m_pWindow = window;
  if (plain) return SDL_GetWindowSurface(window) != nullptr;
  m_pRenderer.reset(SDL_CreateRenderer(window, -1, 0));
  return m_pRenderer != nullptr;
}

SDL_Surface* SdlCanvas::Begin() {
  if (m_pRenderer == nullptr) return SDL_GetWindowSurface(m_pWindow);
  int width = 0;
  int height = 0;
  SDL_GetRendererOutputSize(m_pRenderer.get(), &width, &height);
  m_pPicture.reset(SDL_CreateRGBSurfaceWithFormat(0, width, height, 32, SDL_PIXELFORMAT_ARGB8888));
  return m_pPicture.get();
}

void SdlCanvas::End() {
  if (m_pRenderer == nullptr) {
    SDL_UpdateWindowSurface(m_pWindow);
    return;
  }
  SDL_Renderer* const renderer = m_pRenderer.get();
  const std::unique_ptr<SDL_Texture, Gone> texture(
      SDL_CreateTextureFromSurface(renderer, m_pPicture.get()));
  SDL_RenderCopy(renderer, texture.get(), nullptr, nullptr);
  SDL_RenderPresent(renderer);
}

}  // namespace platform
