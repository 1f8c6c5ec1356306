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
  m_pRenderer = SDL_CreateRenderer(window, -1, 0);
  return m_pRenderer != nullptr;
}

void SdlCanvas::Close() {
  if (m_pTexture != nullptr) SDL_DestroyTexture(m_pTexture);
  if (m_pRenderer != nullptr) SDL_DestroyRenderer(m_pRenderer);
  m_pTexture = nullptr;
  m_pRenderer = nullptr;
}

SDL_Surface* SdlCanvas::Begin() {
  return m_pRenderer == nullptr ? SDL_GetWindowSurface(m_pWindow) : LockTexture();
}

SDL_Surface* SdlCanvas::LockTexture() {
  int width = 0;
  int height = 0;
  SDL_GetRendererOutputSize(m_pRenderer, &width, &height);
  if (m_pTexture != nullptr) SDL_DestroyTexture(m_pTexture);
  m_pTexture = SDL_CreateTexture(m_pRenderer, SDL_PIXELFORMAT_ARGB8888, SDL_TEXTUREACCESS_STREAMING,
                                 width, height);
  SDL_Surface* surface = nullptr;
  if (m_pTexture != nullptr) SDL_LockTextureToSurface(m_pTexture, nullptr, &surface);
  return surface;
}

void SdlCanvas::End() {
  if (m_pRenderer == nullptr) {
    SDL_UpdateWindowSurface(m_pWindow);
    return;
  }
  SDL_UnlockTexture(m_pTexture);
  SDL_RenderCopy(m_pRenderer, m_pTexture, nullptr, nullptr);
  SDL_RenderPresent(m_pRenderer);
}

}  // namespace platform
