// Preloaded into a program: notes when its first frame has reached the display, in the file that
// FIRST_FRAME_FILE names, as microseconds of the system's clock.

#include <SDL_render.h>
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

}  // namespace

void SDL_RenderPresent(SDL_Renderer* renderer) {
  using Present = void (*)(SDL_Renderer*);
  static const auto present = reinterpret_cast<Present>(dlsym(RTLD_NEXT, "SDL_RenderPresent"));
  static bool noted = false;
  present(renderer);
  if (!noted) NoteTime();
  noted = true;
}
