// Decoding and writing of picture files.

#include <SDL_image.h>

#include <cstddef>
#include <memory>

#include "platform/resources.h"

namespace platform {
namespace {

using SurfacePtr = std::unique_ptr<SDL_Surface, decltype(&SDL_FreeSurface)>;

std::optional<CBitmap> ToBitmap(SDL_Surface* decoded) {
  const SurfacePtr owned(decoded, &SDL_FreeSurface);
  if (owned == nullptr) return std::nullopt;
  const SurfacePtr pixels(SDL_ConvertSurfaceFormat(owned.get(), SDL_PIXELFORMAT_ARGB8888, 0),
                          &SDL_FreeSurface);
  if (pixels == nullptr) return std::nullopt;
  CBitmap bitmap({pixels->w, pixels->h});
  for (int y = 0; y < pixels->h; ++y) {
    const auto offset = static_cast<std::ptrdiff_t>(y) * pixels->pitch;
    const auto* row =
        reinterpret_cast<const Pixel*>(static_cast<const Uint8*>(pixels->pixels) + offset);
    for (int x = 0; x < pixels->w; ++x) bitmap.At({x, y}) = row[x];
  }
  return bitmap;
}

}  // namespace

std::optional<CBitmap> DecodePicture(const EmbeddedFile& file) {
  return ToBitmap(IMG_Load_RW(SDL_RWFromConstMem(file.data, static_cast<int>(file.size)), 1));
}

bool SavePng(const CBitmap& bitmap, const std::string& path) {
  std::vector<Pixel> pixels = bitmap.Pixels();
  const Size size = bitmap.GetSize();
  const SurfacePtr surface(
      SDL_CreateRGBSurfaceWithFormatFrom(pixels.data(), size.width, size.height, 32, size.width * 4,
                                         SDL_PIXELFORMAT_ARGB8888),
      &SDL_FreeSurface);
  return surface != nullptr && IMG_SavePNG(surface.get(), path.c_str()) == 0;
}

std::optional<CBitmap> LoadPng(const std::string& path) { return ToBitmap(IMG_Load(path.c_str())); }

}  // namespace platform
