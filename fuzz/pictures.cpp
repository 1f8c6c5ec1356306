// Any bytes as a picture, as they are and with the checksums of a PNG file put right, behind which
// the decoder would otherwise hide.

#include <array>
#include <string>

#include "fuzz/bytes.h"
#include "platform/draw/resources.h"

namespace feltside::fuzz {
namespace {

constexpr std::size_t kSignature = 8;  // bytes, as are the others
constexpr std::size_t kHead = 8;       ///< of a chunk: its length and kind
constexpr std::size_t kSum = 4;

std::uint32_t Checksum(std::string_view bytes) {
  std::uint32_t sum = ~0U;
  for (const char byte : bytes) {
    sum ^= static_cast<unsigned char>(byte);
    for (int bit = 0; bit < 8; ++bit) sum = (sum & 1) != 0 ? sum >> 1 ^ 0xEDB88320U : sum >> 1;
  }
  return ~sum;
}

std::string WithGoodChecksums(std::string file) {
  for (std::size_t at = kSignature; at + kHead + kSum <= file.size();) {
    std::uint32_t length = 0;
    for (std::size_t i = 0; i < 4; ++i) {
      length = length << 8 | static_cast<unsigned char>(file[at + i]);
    }
    if (length > file.size() - at - kHead - kSum) break;
    const std::uint32_t sum = Checksum(std::string_view(file).substr(at + 4, length + 4));
    at += kHead + length;
    for (int shift = 24; shift >= 0; shift -= 8) file[at++] = static_cast<char>(sum >> shift);
  }
  return file;
}

void Decode(const std::string& file) {
  const auto* data = reinterpret_cast<const unsigned char*>(file.data());
  const auto picture = platform::DecodePicture({"picture", data, file.size()});
  if (!picture) return;
  const platform::Size size = picture->GetSize();
  Require(size.width > 0 && size.height > 0, "a picture without pixels");
  Require(picture->Pixels().size() == std::size_t(size.width) * std::size_t(size.height),
          "a picture without all of its pixels");
}

}  // namespace
}  // namespace feltside::fuzz

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string file(reinterpret_cast<const char*>(data), size);
  feltside::fuzz::Decode(file);
  feltside::fuzz::Decode(feltside::fuzz::WithGoodChecksums(file));
  return 0;
}
