// Decoding and writing of PNG pictures.

#include <png.h>

#include <bit>

#include "platform/draw/resources.h"

namespace platform {
namespace {

/// Of the sides of a picture, in pixels; what says that it is larger is damaged.
constexpr png_uint_32 kLongestSide = 4096;

/// Our pixels are 0xAARRGGBB in memory order of this machine.
constexpr png_uint_32 kPixelFormat =
    std::endian::native == std::endian::little ? PNG_FORMAT_BGRA : PNG_FORMAT_ARGB;

png_image StartImage() {
  png_image image{};
  image.version = PNG_IMAGE_VERSION;
  return image;
}

}  // namespace

std::optional<CBitmap> DecodePicture(const EmbeddedFile& file) {
  png_image image = StartImage();
  if (png_image_begin_read_from_memory(&image, file.data, file.size) == 0) return std::nullopt;
  if (image.width > kLongestSide || image.height > kLongestSide) {
    png_image_free(&image);
    return std::nullopt;
  }
  image.format = kPixelFormat;
  CBitmap bitmap({static_cast<int>(image.width), static_cast<int>(image.height)});
  // The library frees what it holds of the picture, whatever comes of it.
  const int read = png_image_finish_read(&image, nullptr, bitmap.Data(),
                                         static_cast<png_int_32>(image.width) * 4, nullptr);
  if (read == 0) return std::nullopt;
  return bitmap;
}

bool SavePng(const CBitmap& bitmap, const std::string& path) {
  png_image image = StartImage();
  image.width = static_cast<png_uint_32>(bitmap.GetSize().width);
  image.height = static_cast<png_uint_32>(bitmap.GetSize().height);
  image.format = kPixelFormat;
  return png_image_write_to_file(&image, path.c_str(), 0, bitmap.Pixels().data(), 0, nullptr) != 0;
}

}  // namespace platform
