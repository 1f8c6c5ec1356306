// The menu and every dialog: as a person has looked at them, whole, and every text readable.

#include <gtest/gtest.h>

#include "platform/draw/look.h"
#include "platform/draw/wrapped_text.h"
#include "tests/render/contrast.h"
#include "tests/support/golden.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

using platform::kBlack;
using platform::kSystemFont;
using platform::kWhite;
using platform::Rect;

using Texts = std::vector<std::string>;

struct Scene {
  std::string golden;  ///< empty: no picture of it is kept
  Texts commands;
  Texts texts;  ///< besides those of the topmost dialog's controls
  std::string settings = {};
};

const std::string kFive =
    "High0 = 'Ann Lee 1250'\nHigh1 = '\u05E9\u05DC\u05D5\u05DD \U0001F600 900'\n"
    "High2 = 'Bob & Co. 300'\nHigh4 = 'Eve 101'\nHigh3 = 'WWWWWWWWWWWWWWWWWWWWWWWWWW 250'\n";
const std::string kLongName = "type A name that is longer than a line of the list";
const std::string kRich = "wallet 250";
const std::string kExit = "command 57665";
const Texts kMenu = {"&BlackJack", "&Game Setup", "&Table Setup ", "High Scores",
                     "&About...",  "Help...",     "E&xit"};
const Texts kBacks = {"Blue",          "Black",          "Purple",    "Smiley",
                      "Dirty Yellow ", "Skull",          "Blue Star", "Purple Star",
                      "Metal Rivet",   "Red Pinstripes", "Wild",      "Blue Pinstripes"};

const std::vector<Scene> kScenes = {
    {"menu", {StackOf("TH 6D KS 7C"), "command 32776", "key F10", "key Down"}, kMenu},
    {"", {"touch 30 12"}, kMenu, kFive},
    {"dialog_about", {"command 57664"}, {"About Feltside"}},
    {"dialog_setup", {"command 32779"}, {"Setup", "?"}},
    {"dialog_setup_list",
     {"command 32779", "press 1008"},
     {"No Strategy", "Button for Strategy", "Always Show Strategy"}},
    {"", {"command 32779", "press 1000"}, {"BlackJack", "Video Poker"}},
    {"", {"command 32779", "press 1007"}, {"Slow", "Normal", "Fast"}},
    {"", {"command 32779", "press 1009"}, {"One Deck", "Four Decks", "Six Decks"}},
    {"dialog_table",
     {"command 32777", "key Shift+Tab", "key Shift+Tab", "key Shift+Tab"},
     {"Setup Table", "?"}},
    {"dialog_table_backs", {"command 32777", "press 1005", "key M"}, kBacks},
    // Red, green and blue at 0, 128 and 255.
    {"dialog_color",
     {"command 32777", "press 1500", "key Tab"},
     {"Edit RGB Color"},
     "TABLECOLOR = 16744448"},
    // The sample follows while the thumb is dragged.
    {"dialog_color_dragged",
     {"command 32777", "press 1500", "slide 6001 0", "down 118 131", "move 118 170"},
     {},
     "TABLECOLOR = 255"},
    {"dialog_table_changed",
     {"command 32777", "press 1500", "slide 6000 255", "press 1", "select 1005 3"},
     {}},
    {"dialog_scores", {"command 32781"}, {"High Scores", "Ann Lee 1250", "Eve 101"}, kFive},
    {"dialog_scores_entry", {kRich, kExit}, {"High Scores"}},
    {"dialog_scores_long_name",
     {kRich, kExit, kLongName, "key Shift+Left", "key Shift+Left"},
     {},
     kFive},
    {"dialog_scores_added", {kRich, kExit, kLongName, "key Enter"}, {}},
    {"dialog_question", {kRich, kExit, "key Enter"}, {"Feltside"}},
};

// White where the keyboard works, and in captions.
const std::vector<Style> kStyles = {{kSystemFont, kBlack},
                                    {kSystemFont, kWhite},
                                    {{kSystemFont.height, true}, kWhite},
                                    {{kSystemFont.height, true}, kBlack},
                                    {kSystemFont, platform::kDisabledText, kDisabled}};

/// What a control shows of its text, line by line; fails where it is too small for it.
Texts LinesOf(const Json& control, const Rect& place) {
  const std::string kind = control["kind"];
  const int number = control["number"];
  // A patch hides its text; what is too long for a list line or an edit is cut there.
  if (kind == "patch" || kind == "edit" || (number >= 6009 && number <= 6013)) return {};
  const int other = kind == "button" ? 4 : kind == "check" ? 17 : kind == "list" ? 21 : 0;
  Texts lines = platform::WrapText(control["text"], place.Width() - other);
  EXPECT_LE(static_cast<int>(lines.size()) * kSystemFont.height, place.Height()) << control;
  for (const std::string& line : lines) {
    const std::string plain = platform::WithoutMnemonic(line);
    EXPECT_LE(MeasureText(kSystemFont, plain).width, place.Width() - other) << control;
  }
  return lines;
}

TEST(Dialogs, AreWholeAndLookAsTheyDidAndCanBeRead) {
  for (const Scene& scene : kScenes) {
    SCOPED_TRACE(scene.golden + testing::PrintToString(scene.commands));
    Stylus stylus("[Settings]\n" + scene.settings + "\n");
    Json state;
    for (const std::string& command : scene.commands) state = Do(stylus, command);
    Texts texts = scene.texts;
    std::vector<Rect> taken;
    for (const Json& control : state["controls"]) {
      if (!control["visible"]) continue;
      const Json& r = control["rect"];
      Rect place{r[0], r[1], r[2], r[3]};
      EXPECT_EQ(place.Common({1, 20, 239, 293}), place) << control;
      const Texts lines = LinesOf(control, place);
      texts.insert(texts.end(), lines.begin(), lines.end());
      if (control["kind"] == "group") continue;
      if (control["kind"] == "static") ++place.top;  // no letter reaches that high
      for (const Rect& other : taken) EXPECT_TRUE(place.Common(other).IsEmpty()) << control;
      taken.push_back(place);
    }
    const platform::CBitmap shot = stylus.Shot();
    // An open list lies over some of the dialog's own texts.
    if (state["windows"].back().get<std::string>().empty()) texts = scene.texts;
    ExpectReadable(shot, texts, kStyles);
    if (!scene.golden.empty()) ExpectGolden(shot, scene.golden);
  }
}

}  // namespace
}  // namespace feltside::tests
