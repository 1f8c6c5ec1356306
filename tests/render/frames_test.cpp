// Texts and pictures of the table at their pixels.

#include <gtest/gtest.h>

#include "platform/draw/resources.h"
#include "shell/res/pictures.h"
#include "tests/render/contrast.h"
#include "tests/render/table_styles.h"
#include "tests/support/golden.h"
#include "tests/support/scenes.h"

namespace feltside::tests {
namespace {

using platform::CBitmap;
using platform::MeasureText;
using platform::Point;

struct PlacedText {
  std::string text;
  Style style;
  Point at;
};
struct PlacedPicture {
  int number;
  Point at;
  platform::Size size;  ///< what can be seen of it
};
struct PlacedFrame {
  std::string scene;
  std::vector<PlacedText> texts;
  std::vector<PlacedPicture> pictures;
};

/// Where a text begins that ends at a place.
int Before(int right, const std::string& text, int height) {
  return right - MeasureText(platform::Font{height}, text).width;
}

std::vector<PlacedFrame> PlacedFrames() {
  const int button = MeasureText({22}, "Play").width / 2;
  const int title = MeasureText({13, true}, "Player").width / 2;
  return {{"insurance",
           {{"Dealer", kNormal, {Before(69, "Dealer", 11), 10}},
            {"You", kNormal, {Before(69, "You", 11), 247}},
            {"16", kTotal, {154, 247}},
            {"Player", kBoxTitle, {66 - title, 97}},
            {"Wallet: $100.00", kBox, {Before(110, "Wallet: $100.00", 13), 120}},
            {"Current Bet: $5", kBox, {Before(110, "Current Bet: $5", 13), 138}}},
           {{54, {79, 10}, {9, 41}},
            {40, {88, 10}, {29, 41}},
            {22, {79, 217}, {9, 41}},
            {46, {88, 217}, {29, 41}},
            {133, {168, 107}, {24, 22}},
            {139, {56, 190}, {73, 17}},
            {143, {130, 190}, {55, 17}}}},
          {"eleven_advice",
           {{"Basic Strategy says:", kAdvice, {125, 139}}, {"Double Down", kAdvice, {125, 157}}},
           {}},
          {"split_settled",
           {{"21", kTotal, {94, 247}},
            {"18", kTotal, {214, 247}},
            {"25", kTotal, {154, 10}},
            {"Winner!", kMessage, {19, 201}},
            {"Winner!", kMessage, {139, 201}}},
           {{141, {16, 97}, {13, 13}}}},
          {"won", {{"Winner!", kResult, {79, 198}}}, {}},
          {"plain_poker_marked",
           {{"Royal Flush", kNormal, {5, 5}},
            {"Straight", kNormal, {123, 17}},
            {"Two Pair", kNormal, {123, 41}},
            {"250", kNormal, {117 - MeasureText({11}, "888").width, 5}},
            {"Play", kButton, {120 - button, 174}},
            {"$99", kAmount, {Before(69, "$99", 11), 233}}},
           {{43, {40, 114}, {29, 41}}, {54, {172, 114}, {29, 41}}}},
          {"two_pair_kept",
           {{"Deal", kCell, {103, 192}},
            {"$101", kCell, {26, 233}},
            {"Two Pair", kResultCell, {135, 235}}},
           {}}};
}

TEST(Frames, HaveEverythingAtItsPixels) {
  platform::CResources pictures(PictureFiles());
  for (const PlacedFrame& placed : PlacedFrames()) {
    const CBitmap table = TableOf(Play(placed.scene)->Shot());
    for (const PlacedText& text : placed.texts) {
      const auto places = PlacesOf(table, text.text, text.style);
      EXPECT_EQ(std::count(places.begin(), places.end(), text.at), 1) << text.text;
    }
    for (const auto& [number, at, size] : placed.pictures) {
      CBitmap shown(size);
      CBitmap picture(size);
      platform::CSurface(shown).BitBlt({}, size, table, at);
      platform::CSurface(picture).BitBlt({}, size, pictures.LoadBitmap(number, size));
      ExpectSame(shown, picture, "picture_" + std::to_string(number));
    }
  }
}

struct Drawing {
  platform::Rect part;
  double bound = kReadable;
};

TEST(Frames, ShowWhatIsWrittenInPicturesAndGreyedButtons) {
  struct Screen {
    std::string scene;
    std::vector<Drawing> drawings;  ///< in the window
  };
  std::vector<Screen> screens = {{"title", {{{75, 103, 165, 124}}}},
                                 {"insurance",
                                  {{{61, 220, 124, 230}},
                                   {{135, 220, 180, 230}},
                                   {{172, 137, 188, 151}},
                                   // Greyed: the stake and the five moves.
                                   {{86, 185, 96, 195}, kDisabled},
                                   {{102, 185, 112, 195}, kDisabled},
                                   {{67, 5, 83, 20}, kDisabled},
                                   {{91, 5, 107, 20}, kDisabled},
                                   {{120, 5, 136, 20}, kDisabled},
                                   {{149, 5, 165, 20}, kDisabled},
                                   {{178, 5, 194, 20}, kDisabled}}},
                                 {"queens",
                                  {{{25, 45, 56, 52}},
                                   {{76, 41, 164, 58}},
                                   {{182, 45, 217, 52}},
                                   {{204, 214, 216, 222}},
                                   {{197, 225, 222, 232}},
                                   {{8, 246, 35, 253}},
                                   {{124, 246, 149, 253}}}}};
  for (int row = 71; row < 71 + 4 * 16; row += 16) {  // the pay table
    for (const auto& [left, right] : {std::pair{13, 80}, {95, 115}, {125, 196}, {216, 226}}) {
      screens[2].drawings.push_back({{left, row, right, row + 10}});
    }
  }
  for (const Screen& screen : screens) {
    const CBitmap shot = Play(screen.scene)->Shot();
    for (const auto& [part, bound] : screen.drawings) ExpectVisible(shot, part, bound);
  }
}

TEST(Frames, ShowTheTitleWhateverTheGame) {
  EXPECT_EQ(Stylus("[Settings]\nGAME_TYPE = 1\nFANCYVP = 0\n").Shot(), Play("title")->Shot());
}

}  // namespace
}  // namespace feltside::tests
