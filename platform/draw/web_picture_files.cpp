// Pictures that the web edition's plain_picture.py has laid out: a page needs no decoder for them.

#include <algorithm>
#include <array>

#include "platform/draw/resources.h"

namespace platform {

std::optional<CBitmap> DecodePicture(const EmbeddedFile& file) {
  const unsigned char* at = file.data;
  const auto next = [&at] { return static_cast<unsigned>(*at++); };
  const auto nextPair = [&next] {
    const unsigned low = next();
    return static_cast<int>(low | next() << 8);
  };
  const int width = nextPair();
  const int height = nextPair();
  std::array<Pixel, 256> colors{};
  const unsigned last = next();
  for (unsigned i = 0; i <= last; ++i) {
    for (unsigned shift = 0; shift < 32; shift += 8) colors[i] |= next() << shift;
  }
  CBitmap bitmap({width, height});
  for (Pixel* pixel = bitmap.Data(); at != file.data + file.size;) {
    const unsigned alike = next();
    pixel = std::fill_n(pixel, alike, colors[next()]);
  }
  return bitmap;
}

}  // namespace platform
