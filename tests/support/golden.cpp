#include "tests/support/golden.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>

#include "platform/draw/resources.h"
#include "tests/support/temporary_folder.h"

namespace feltside::tests {
namespace {

namespace fs = std::filesystem;
using platform::CBitmap;

/// The actual picture, faint, with every pixel that differs in red.
CBitmap DifferenceOf(const CBitmap& actual, const CBitmap& stored, int& count) {
  CBitmap difference = actual;
  for (int y = 0; y < actual.GetSize().height; ++y) {
    for (int x = 0; x < actual.GetSize().width; ++x) {
      platform::Pixel& pixel = difference.At({x, y});
      const bool same = stored.Bounds().Contains({x, y}) && stored.At({x, y}) == pixel;
      pixel = same ? 0xFFC0C0C0U | (pixel >> 2 & 0x3F3F3FU) : 0xFFFF0000U;
      count += same ? 0 : 1;
    }
  }
  return difference;
}

}  // namespace

CBitmap ReadPicture(const fs::path& path) {
  const std::string bytes = ReadFile(path);
  const auto* data = reinterpret_cast<const unsigned char*>(bytes.data());
  return platform::DecodePicture({"", data, bytes.size()}).value_or(CBitmap());
}

void ExpectSame(const CBitmap& actual, const CBitmap& expected, const std::string& name) {
  if (expected == actual) return;
  int count = 0;
  const fs::path folder = FELTSIDE_DIFFERENCE_FOLDER;
  fs::create_directories(folder);
  platform::SavePng(actual, (folder / (name + ".actual.png")).string());
  platform::SavePng(DifferenceOf(actual, expected, count),
                    (folder / (name + ".difference.png")).string());
  ADD_FAILURE() << name << ": " << count << " pixels differ; see " << folder;
}

void ExpectGolden(const CBitmap& actual, const std::string& name) {
  const std::string golden = (fs::path(FELTSIDE_GOLDEN_FOLDER) / (name + ".png")).string();
  const char* renew = std::getenv("FELTSIDE_RENEW_GOLDEN");
  if (renew != nullptr && std::string(renew) == "1") {
    ASSERT_TRUE(platform::SavePng(actual, golden)) << golden;
    return;
  }
  SCOPED_TRACE("stored as " + golden + "; FELTSIDE_RENEW_GOLDEN=1 renews it");
  ExpectSame(actual, ReadPicture(golden), name);
}

}  // namespace feltside::tests
