// Preloaded into a program: notes when its first frame has reached the display, in the file that
// FIRST_FRAME_FILE names, as microseconds of the system's clock.

#include <SDL_render.h>
#include <SDL_video.h>
#include <dlfcn.h>

#include <cstdio>
#include <cstdlib>
#include <ctime>

namespace {

void NoteTime() {
  timespec now{};
  clock_gettime(CLOCK_REALTIME, &now);
  const char* path = std::getenv("FIRST_FRAME_FILE");
  std::FILE* file = path == nullptr ? nullptr : std::fopen(path, "w");
  if (file == nullptr) return;
  std::fprintf(file, "%lld%06ld\n", static_cast<long long>(now.tv_sec), now.tv_nsec / 1000);
  std::fclose(file);
}

/// The first time only.
void NoteFrame() {
  static bool noted = false;
  if (!noted) NoteTime();
  noted = true;
}

/// SDL's own function of that name.
template <class Function>
Function* Behind(const char* name) {
  return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

}  // namespace

// A frame reaches the display by one of these two.

void SDL_RenderPresent(SDL_Renderer* renderer) {
  static auto* const present = Behind<decltype(SDL_RenderPresent)>("SDL_RenderPresent");
  present(renderer);
  NoteFrame();
}

int SDL_UpdateWindowSurface(SDL_Window* window) {
  static auto* const update = Behind<decltype(SDL_UpdateWindowSurface)>("SDL_UpdateWindowSurface");
  const int result = update(window);
  NoteFrame();
  return result;
}
