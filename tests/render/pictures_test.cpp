// The picture files: every number is there, in its size, within its number of colours.

#include "shell/res/pictures.h"

#include <gtest/gtest.h>

#include <set>

#include "platform/draw/resources.h"
#include "render/picture_ids.h"

namespace feltside::tests {
namespace {

using platform::Color;
using platform::Rgb;
using platform::Size;

constexpr std::size_t kManyColors = 256;

struct Kind {
  std::string prefix;
  std::vector<int> numbers;
  Size size;
  std::size_t colors = 16;
};

std::vector<int> Range(int first, int last) {
  std::vector<int> numbers;
  for (int number = first; number <= last; ++number) numbers.push_back(number);
  return numbers;
}

const std::vector<Kind> kKinds = {{"", Range(1, 52), {29, 41}},
                                  {"", Range(54, 63), {29, 41}},
                                  {"", {64}, {29, 41}, kManyColors},
                                  {"", {65}, {29, 41}},
                                  {"", {128}, {80, 15}},
                                  {"", {130}, {240, 268}, kManyColors},
                                  {"", {133}, {24, 22}},
                                  {"", {134}, {8, 4}},
                                  {"", {139}, {73, 17}},
                                  {"", {140}, {96, 116}, kManyColors},
                                  {"", {141, 144}, {13, 13}},
                                  {"", {142}, {240, 270}, kManyColors},
                                  {"", {143}, {55, 17}},
                                  {"icon_", Range(136, 139), {16, 16}}};

/// The one file of a number.
platform::EmbeddedFile FileOf(const std::string& prefix, int number) {
  std::string digits = std::to_string(number);
  digits.insert(0, 3 - digits.size(), '0');
  const std::string start = prefix + digits + "_";
  std::vector<platform::EmbeddedFile> found;
  for (const platform::EmbeddedFile& file : PictureFiles()) {
    if (file.name.substr(0, start.size()) == start) found.push_back(file);
  }
  EXPECT_EQ(found.size(), 1U) << start;
  return found.empty() ? platform::EmbeddedFile{} : found[0];
}

TEST(Pictures, HaveTheirSizesAndColors) {
  std::set<std::vector<platform::Pixel>> different;
  std::size_t count = 0;
  for (const Kind& kind : kKinds) {
    for (const int number : kind.numbers) {
      const platform::EmbeddedFile file = FileOf(kind.prefix, number);
      const auto picture = platform::DecodePicture(file);
      ASSERT_TRUE(picture.has_value()) << number;
      EXPECT_EQ(picture->GetSize(), kind.size) << number;
      const auto& pixels = picture->Pixels();
      const std::set<platform::Pixel> colors(pixels.begin(), pixels.end());
      EXPECT_LE(colors.size(), kind.colors) << number;
      constexpr std::size_t kColorTypeAt = 25;
      EXPECT_EQ(file.data[kColorTypeAt], 3) << file.name << " has no palette";
      different.insert(pixels);
      ++count;
    }
  }
  EXPECT_EQ(different.size(), count);  // no picture twice
}

TEST(Pictures, HaveTheProgramsIconInBothItsSizes) {
  platform::CResources resources(PictureFiles());
  for (const int width : {16, 32}) {
    const auto icon = resources.LoadIconOfSize(128, width);
    ASSERT_TRUE(icon.has_value());
    EXPECT_EQ(icon->GetSize(), (Size{width, width}));
    const std::set<platform::Pixel> colors(icon->Pixels().begin(), icon->Pixels().end());
    EXPECT_LE(colors.size(), 16U);
  }
}

TEST(Pictures, HaveCellsForTheTextsOfVideoPoker) {
  const auto picture = platform::DecodePicture(FileOf("", IDB_POKER_TABLE));
  ASSERT_TRUE(picture.has_value());
  struct Cell {
    platform::Rect rect;
    Color color = platform::kBlack;
  };
  // As much as a text of the usual length covers.
  for (const Cell& cell :
       {Cell{{103, 192, 130, 207}, Rgb(82, 23, 139)}, Cell{{26, 233, 70, 248}, Rgb(20, 71, 139)},
        Cell{{135, 235, 225, 250}, Rgb(82, 115, 132)}}) {
    for (int y = cell.rect.top; y < cell.rect.bottom; ++y) {
      for (int x = cell.rect.left; x < cell.rect.right; ++x) {
        ASSERT_EQ(platform::ToColor(picture->At({x, y})), cell.color) << x << ", " << y;
      }
    }
  }
}

}  // namespace
}  // namespace feltside::tests
