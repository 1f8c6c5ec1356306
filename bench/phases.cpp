#include "bench/phases.h"

namespace feltside::bench {
namespace {

using platform::Font;
using platform::kBlack;
using platform::kWhite;
using platform::Rgb;

constexpr platform::Rect kTable{0, 0, 240, 268};
constexpr platform::Color kBox = Rgb(135, 180, 100);
constexpr platform::Color kRed = Rgb(200, 0, 0);
constexpr Font kSmall{11, false};
constexpr Font kTotal{11, true};
constexpr Font kPlain{13, false};

/// Where a text begins that ends at a place.
int Before(int right, const Font& font, const std::string& text) {
  return right - platform::MeasureText(font, text).width;
}

/// The filled and framed box of the player.
std::vector<PlacedFill> PlayerBox() {
  return {{{12, 92, 120, 176}, kBlack}, {{13, 93, 119, 175}, kBox}, {{12, 114, 120, 115}, kBlack}};
}

/// What is written in it, and beside the hands.
std::vector<PlacedText> PlayerTexts(const std::string& wallet) {
  const Font bold{13, true};
  const int title = platform::MeasureText(bold, "Player").width / 2;
  return {{"Player", bold, kBlack, {66 - title, 97}},
          {wallet, kPlain, kBlack, {Before(110, kPlain, wallet), 120}},
          {"Current Bet: $5", kPlain, kBlack, {Before(110, kPlain, "Current Bet: $5"), 138}},
          {"Dealer", kSmall, kBlack, {Before(69, kSmall, "Dealer"), 10}}};
}

Phase Title() { return {"title", "", {}, {}, {{kTable, kWhite}}, {{140, {72, 76}}}, {}}; }

Phase Insurance() {
  Phase phase{"insurance",
              "",
              {"stack 9D 7S 5C AS 2H 3C", "command deal"},
              {{130, {0, 0}}},
              PlayerBox(),
              {{139, {56, 190}},
               {143, {130, 190}},
               {22, {79, 217}},
               {46, {88, 217}},
               {54, {79, 10}},
               {40, {88, 10}},
               {138, {83, 156}, true},
               {139, {99, 156}, true},
               {133, {168, 107}}},
              PlayerTexts("Wallet: $100.00")};
  phase.texts.push_back({"You", kSmall, kBlack, {Before(69, kSmall, "You"), 247}});
  phase.texts.push_back({"16", kTotal, kRed, {154, 247}});
  return phase;
}

Phase SplitSettled() {
  Phase phase{"split settled",
              "PLAYSPEED = 2\n",
              {"stack 8C 8D TS 6H 3S TH KD 9C", "command deal", "command split", "command double",
               "command stand"},
              {{130, {0, 0}}},
              PlayerBox(),
              {{8, {19, 217}},
               {42, {28, 217}},
               {26, {37, 217}},
               {21, {139, 217}},
               {36, {148, 217}},
               {49, {79, 10}},
               {32, {88, 10}},
               {9, {97, 10}},
               {137, {83, 156}, true},
               {136, {99, 156}, true},
               {141, {16, 97}}},
              PlayerTexts("Wallet: $115.00")};
  for (const PlacedText& text : {PlacedText{"Winner!", kSmall, kRed, {19, 201}},
                                 {"Winner!", kSmall, kRed, {139, 201}},
                                 {"21", kTotal, kRed, {94, 247}},
                                 {"18", kTotal, kRed, {214, 247}},
                                 {"25", kTotal, kRed, {154, 10}}}) {
    phase.texts.push_back(text);
  }
  return phase;
}

Phase PokerMarked() {
  const Font cell{15, true};
  return {"poker marked",
          "GAME_TYPE = 1\nCARDBACK = 59\n",
          {"stack 7S 7D QS QH AS 2C", "command deal", "key 1", "key 4", "key 5"},
          {{130, {0, 0}}, {142, {0, 0}}},
          {},
          {{59, {40, 114}}, {46, {73, 114}}, {20, {106, 114}}, {59, {139, 114}}, {59, {172, 114}}},
          {{"Play", cell, kWhite, {103, 192}}, {"$99", cell, kWhite, {26, 233}}}};
}

}  // namespace

const std::vector<Phase>& Phases() {
  static const std::vector<Phase> phases = {Title(), Insurance(), SplitSettled(), PokerMarked()};
  return phases;
}

}  // namespace feltside::bench
