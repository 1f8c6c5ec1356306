// Every screen of tools/scenes.txt: as a person has looked at it, whole, and every text readable.

#include "tests/support/scenes.h"

#include <gtest/gtest.h>

#include <cmath>

#include "platform/draw/look.h"
#include "platform/draw/wrapped_text.h"
#include "render/money_text.h"
#include "tests/render/contrast.h"
#include "tests/render/table_styles.h"
#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

using platform::kBlack;
using platform::kSystemFont;
using platform::kWhite;
using platform::Rect;

using Texts = std::vector<std::string>;

const std::string kHeading = "Basic Strategy says:";

/// White where the keyboard works, and in captions.
const std::vector<Style> kDialogStyles = {{kSystemFont, kBlack},
                                          {kSystemFont, kWhite},
                                          {{kSystemFont.height, true}, kWhite},
                                          {{kSystemFont.height, true}, kBlack},
                                          {kSystemFont, platform::kDisabledText, kDisabled}};

/// The felt's colour is the player's choice.
std::vector<Style> StylesOn(bool felt) {
  std::vector<Style> styles = {kNormal, kMessage, kTotal,  kResult,     kBox,   kBoxTitle,
                               kAdvice, kCell,    kButton, kResultCell, kAmount};
  for (Style& style : styles) {
    if (felt && style.color == kRed) style.bound = kOnlyListed;
  }
  return styles;
}

Texts BlackjackTexts(const Json& state) {
  Texts texts = {"Dealer", "Player", "Wallet: " + MoneyText(state["m_dWallet"], 2),
                 "Current Bet: " + MoneyText(state["m_nBet"], 0)};
  if (state["m_handSplit"].empty()) texts.push_back("You");
  for (const char* member : {"m_strPlayerScore", "m_strPlayerMsg", "m_strSplitScore",
                             "m_strSplitMsg", "m_strDealerScore"}) {
    texts.push_back(state[member]);
  }
  return texts;
}

Texts PokerTexts(const Json& state) {
  const double wallet = state["m_dWallet"];
  Texts texts = {state["m_bHandInProgress"] == 0 ? "Deal" : "Play", state["m_strPlayerMsg"]};
  if (state["m_bFancyPoker"] == 1) {
    texts.push_back(MoneyText(std::floor(wallet + 0.5), 0));
    return texts;
  }
  // A single digit might be found on a card; it stands on the same white as all of these.
  for (const char* text : {"You", "Royal Flush", "250", "Flush", "Straight Flush", "50", "Straight",
                           "Four of a Kind", "20", "Three of a Kind", "Full House", "Two Pair"}) {
    texts.push_back(text);
  }
  texts.push_back(MoneyText(std::trunc(wallet), 0));
  return texts;
}

void CheckTable(Stylus& stylus, const Json& state, Texts texts) {
  const platform::CBitmap shot = stylus.Shot();
  const bool advises = std::count(texts.begin(), texts.end(), kHeading) > 0;
  EXPECT_EQ(!PlacesOf(shot, kHeading, kAdvice).empty(), advises);
  if (state["m_bShowTitle"] == 0) {
    const Texts more = state["m_nGameType"] == 0 ? BlackjackTexts(state) : PokerTexts(state);
    texts.insert(texts.end(), more.begin(), more.end());
  }
  ExpectReadable(shot, texts, StylesOn(state["m_bFancyBlackjack"] == 0));
  // Every operation has painted what it changed: painting anew brings nothing else.
  stylus.Send("wallet " + ToText(state["m_dWallet"]));
  EXPECT_EQ(stylus.Shot(), shot);
}

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

/// The texts of the topmost dialog; fails where its controls do not fit into the window or lie over
/// one another.
Texts DialogTexts(const Json& state) {
  Texts texts;
  std::vector<Rect> taken;
  for (const Json& control : state["controls"]) {
    if (!control["visible"]) continue;
    const Json& r = control["rect"];
    Rect place{r[0], r[1], r[2], r[3]};
    EXPECT_EQ(place.Intersection({1, 20, 239, 293}), place) << control;
    const Texts lines = LinesOf(control, place);
    texts.insert(texts.end(), lines.begin(), lines.end());
    if (control["kind"] == "group") continue;
    if (control["kind"] == "static") ++place.top;  // no letter reaches that high
    for (const Rect& other : taken) EXPECT_TRUE(place.Intersection(other).IsEmpty()) << control;
    taken.push_back(place);
  }
  texts.push_back(state["windows"].back());
  return texts;
}

void CheckScene(const Scene& scene) {
  const auto stylus = Play(scene);
  const Json state = stylus->Send("state");
  const platform::CBitmap shot = stylus->Shot();
  const bool table = state["windows"].size() == 1;
  if (scene.golden) ExpectGolden(table ? TableOf(shot) : shot, scene.name);
  if (table) {
    CheckTable(*stylus, state, scene.reads);
  } else {
    Texts texts = DialogTexts(state);
    // An open list lies over some of the dialog's own texts.
    if (texts.back().empty() || state["controls"].empty()) texts.clear();
    texts.insert(texts.end(), scene.reads.begin(), scene.reads.end());
    ExpectReadable(shot, texts, kDialogStyles);
  }
}

TEST(Scenes, LookAsTheyDidAndCanBeRead) {
  ASSERT_FALSE(Scenes().empty());
  for (const Scene& scene : Scenes()) {
    SCOPED_TRACE(scene.name);
    CheckScene(scene);
  }
}

}  // namespace
}  // namespace feltside::tests
