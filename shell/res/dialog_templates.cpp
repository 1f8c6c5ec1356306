#include "shell/res/dialog_templates.h"

#include "platform/dialog/dialog.h"
#include "render/picture_ids.h"

namespace feltside {
namespace {

using platform::ControlKind;
using platform::ControlTemplate;
using platform::kNoControlID;
using platform::UnitRect;

ControlTemplate Label(const char* text, const UnitRect& place) {
  return {ControlKind::kStatic, kNoControlID, text, place};
}

ControlTemplate OkButton(const UnitRect& place) {
  return {ControlKind::kDefaultButton, platform::kResultOk, "OK", place};
}

ControlTemplate CancelButton(const UnitRect& place) {
  return {ControlKind::kPushButton, platform::kResultCancel, "Cancel", place};
}

}  // namespace

platform::DialogTemplate AboutTemplate() {
  ControlTemplate picture{ControlKind::kPicture, kNoControlID, "", {34, 7, 64, 71}};
  picture.resourceID = IDB_TITLE;
  ControlTemplate version = Label("Feltside Version 1.00", {12, 89, 102, 8});
  version.centered = true;
  return {"About Feltside", 125, 149, {picture, version}};
}

platform::DialogTemplate SetupTemplate() {
  const auto list = [](int controlID, UnitRect place, std::vector<std::string> items) {
    return ControlTemplate{ControlKind::kComboBox, controlID, "", place, std::move(items)};
  };
  return {"Setup",
          138,
          145,
          {Label("Game Type:", {7, 1, 115, 9}),
           list(kSetupGameType, {7, 11, 115, 74}, {"BlackJack", "Video Poker"}),
           Label("Computer's Play Speed:", {7, 29, 115, 9}),
           list(kSetupSpeed, {7, 41, 115, 39}, {"Slow", "Normal", "Fast"}),
           Label("BlackJack Strategy:", {7, 59, 115, 9}),
           list(kSetupStrategy, {7, 71, 115, 39},
                {"No Strategy", "Button for Strategy", "Always Show Strategy"}),
           Label("Blackjack Number of Decks:", {7, 89, 115, 9}),
           list(kSetupDecks, {7, 101, 115, 39}, {"One Deck", "Four Decks", "Six Decks"}),
           OkButton({31, 121, 35, 14}), CancelButton({70, 121, 35, 14})}};
}

platform::DialogTemplate SetupTableTemplate() {
  const auto patch = [](int controlID, UnitRect place) {
    return ControlTemplate{ControlKind::kPatch, controlID, "CL", place};
  };
  const auto button = [](int controlID, const char* text, UnitRect place) {
    return ControlTemplate{ControlKind::kPushButton, controlID, text, place};
  };
  const auto check = [](int controlID, const char* text, UnitRect place) {
    return ControlTemplate{ControlKind::kCheckBox, controlID, text, place};
  };
  return {"Setup Table",
          132,
          154,
          {patch(kTableColorSwatch, {8, 7, 12, 11}),
           button(kTableColorButton, "Table Color", {22, 6, 41, 12}),
           patch(kTableBoxSwatch, {68, 7, 12, 11}),
           button(kTableBoxButton, "Player Box", {82, 6, 41, 12}),
           Label("Card Back:", {8, 24, 39, 9}),
           {ControlKind::kComboBox,
            kTableCardBack,
            "",
            {53, 23, 71, 64},
            {"Blue", "Black", "Purple", "Smiley", "Dirty Yellow ", "Red Pinstripes",
             "Blue Pinstripes", "Skull", "Blue Star", "Purple Star", "Metal Rivet", "Wild"}},
           check(kTableUseHighScores, "Use High Score System", {7, 72, 89, 12}),
           check(kTableFancyBlackjack, "Fancy Blackjack", {7, 85, 66, 12}),
           check(kTableFancyPoker, "Fancy Video Poker", {7, 98, 73, 11}),
           check(kTableFiveDiscards, "5 Discards in Video Poker (default 3)", {7, 110, 95, 16}),
           OkButton({13, 132, 50, 14}),
           CancelButton({68, 132, 50, 14})}};
}

platform::DialogTemplate EditColorTemplate() {
  // An up-down writes into the number box before it.
  const auto number = [](int part, UnitRect place) {
    return ControlTemplate{ControlKind::kNumberBox, kColorFirstNumber + part, "", place};
  };
  const auto upDown = [](int part, UnitRect place) {
    return ControlTemplate{ControlKind::kUpDown, kColorFirstUpDown + part, "", place};
  };
  const auto slider = [](int part, UnitRect place) {
    return ControlTemplate{ControlKind::kSlider, kColorFirstSlider + part, "", place};
  };
  return {"Edit RGB Color",
          116,
          126,
          {{ControlKind::kGroupBox, kNoControlID, "", {4, 0, 106, 104}},
           {ControlKind::kPatch, kColorSample, " This is where the color goes ", {7, 7, 98, 12}},
           number(0, {6, 22, 29, 12}),
           upDown(0, {25, 26, 11, 12}),
           number(1, {38, 22, 29, 12}),
           upDown(1, {62, 25, 11, 12}),
           number(2, {73, 22, 29, 12}),
           upDown(2, {97, 25, 11, 12}),
           Label("Red:", {7, 33, 28, 9}),
           slider(0, {9, 42, 22, 58}),
           Label("Green:", {39, 33, 28, 9}),
           slider(1, {44, 42, 22, 60}),
           Label("Blue:", {77, 33, 28, 9}),
           slider(2, {79, 42, 22, 60}),
           OkButton({24, 108, 30, 14}),
           CancelButton({60, 108, 30, 14})}};
}

platform::DialogTemplate HighScoresTemplate() {
  platform::DialogTemplate form{"High Scores", 152, 146, {}};
  form.controls.push_back({ControlKind::kGroupBox, kNoControlID, "High Score", {2, 3, 147, 87}});
  for (int place = 0; place < 5; ++place) {
    const int y = 12 + 15 * place;
    form.controls.push_back(
        {ControlKind::kStatic, kNoControlID, std::to_string(place + 1) + ".", {7, y, 7, 8}});
    ControlTemplate line{ControlKind::kStatic, kScoresFirstLine + place, "", {20, y, 125, 8}};
    line.plainText = true;
    form.controls.push_back(line);
  }
  form.controls.push_back({ControlKind::kStatic,
                           kScoresMessage,
                           "You have reached a New High Score!!",
                           {9, 94, 124, 8}});
  form.controls.push_back(
      {ControlKind::kStatic, kScoresNameLabel, "Enter Name:", {12, 110, 40, 8}});
  form.controls.push_back({ControlKind::kEdit, kScoresName, "", {58, 107, 67, 14}});
  form.controls.push_back({ControlKind::kPushButton, kScoresAdd, "Add", {127, 107, 18, 14}});
  form.controls.push_back(OkButton({49, 126, 50, 14}));
  return form;
}

}  // namespace feltside
