// The picture files: every number is there, in its size, within its number of colours.

#include "shell/res/pictures.h"

#include <gtest/gtest.h>

#include <set>

#include "platform/draw/resources.h"
#include "platform/draw/text.h"
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
    platform::Rect rect;  ///< all that is flat in the colour
    Color color = platform::kBlack;
    platform::Point text;
    std::vector<std::string> longest;
  };
  for (const Cell& cell :
       {Cell{{97, 182, 138, 213}, Rgb(82, 23, 139), {103, 192}, {"Deal", "Play"}},
        Cell{{4, 230, 114, 254}, Rgb(20, 71, 139), {26, 233}, {"$1000000", "$-1000000"}},
        Cell{{126, 230, 236, 254},
             Rgb(82, 115, 132),
             {135, 235},
             {"Three of a Kind", "Four of a Kind", "Straight Flush", "Royal Flush"}}}) {
    for (int y = cell.rect.top; y < cell.rect.bottom; ++y) {
      for (int x = cell.rect.left; x < cell.rect.right; ++x) {
        ASSERT_EQ(platform::ToColor(picture->At({x, y})), cell.color) << x << ", " << y;
      }
    }
    constexpr int kClear = 3;  // around the text, so that it does not stand against an edge
    for (const std::string& text : cell.longest) {
      const Size size = platform::MeasureText({15, true}, text);
      EXPECT_GE(cell.text.x, cell.rect.left + kClear);
      EXPECT_LE(cell.text.x + size.width, cell.rect.right - kClear) << text;
      EXPECT_GE(cell.text.y, cell.rect.top + kClear);
      EXPECT_LE(cell.text.y + size.height, cell.rect.bottom - kClear);
    }
  }
}

}  // namespace
}  // namespace feltside::tests
