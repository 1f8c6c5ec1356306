// The least that a program with a window does: what the game's start and size are measured against.
// It sets the same hints, opens a window of the same kind and size, shows a picture and sleeps.

#include <SDL.h>

#include <cstdlib>

namespace {

constexpr int kFrameWidth = 240;
constexpr int kFrameHeight = 294;

void ShowPicture(int multiple) {
  SDL_Window* window = SDL_CreateWindow("bare", SDL_WINDOWPOS_CENTERED, SDL_WINDOWPOS_CENTERED,
                                        kFrameWidth * multiple, kFrameHeight * multiple,
                                        SDL_WINDOW_RESIZABLE | SDL_WINDOW_ALLOW_HIGHDPI);
  SDL_Surface* picture =
      SDL_CreateRGBSurfaceWithFormat(0, kFrameWidth, kFrameHeight, 32, SDL_PIXELFORMAT_ARGB8888);
  SDL_BlitScaled(picture, nullptr, SDL_GetWindowSurface(window), nullptr);
  SDL_UpdateWindowSurface(window);
}

}  // namespace

/// Takes the whole multiple at which the picture is shown.
int main(int argc, char** argv) {
  SDL_SetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0");
  if (argc != 2 || SDL_Init(SDL_INIT_VIDEO) != 0) return EXIT_FAILURE;
  ShowPicture(std::atoi(argv[1]));
  SDL_Event event;
  while (SDL_WaitEvent(&event) != 0 && event.type != SDL_QUIT) {
  }
  SDL_Quit();
  return EXIT_SUCCESS;
}
