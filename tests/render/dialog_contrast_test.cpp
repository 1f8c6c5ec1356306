// The texts of the menu and of every dialog can be read.

#include <gtest/gtest.h>

#include "platform/look.h"
#include "platform/wrapped_text.h"
#include "shell/res/dialog_templates.h"
#include "shell/res/frame_resources.h"
#include "tests/render/contrast.h"
#include "tests/support/hands.h"

namespace feltside::tests {
namespace {

using platform::Color;
using platform::DialogTemplate;
using platform::kBlack;
using platform::kSystemFont;
using platform::kWhite;
using platform::Point;
using platform::Rect;

TEST(Contrast, HoldsForTheMenu) {
  const std::string scores = "[Settings]\nHigh0 = \"Ann 300\"";
  struct Case {
    std::string profile;
    std::vector<std::string> commands;
    int selected;
  };
  const std::string sixteen = StackOf("TH 6D KS 7C");
  const std::string deal = "command 32776";
  for (const Case& menu : {Case{scores, {"touch 30 12"}, -1}, Case{scores, {"key Alt+B"}, 0},
                           Case{"", {sixteen, deal, "key Alt+B"}, 0},
                           Case{"", {sixteen, deal, "key Alt+B", "key Down"}, 1}}) {
    Stylus stylus(menu.profile);
    const Json state = StateAfter(stylus, menu.commands);
    std::vector<Text> texts = {{"&BlackJack", {2, 2, 30, 24}, kSystemFont, kWhite}};
    int line = 0;
    for (const platform::MenuItem& item : MainMenu().items) {
      const bool enabled = state["enabled"].value(std::to_string(item.commandID), false);
      const Color live = line++ == menu.selected ? kWhite : kBlack;
      texts.push_back({item.text,
                       {4, 25, 60, 150},
                       kSystemFont,
                       enabled ? live : platform::kDisabledText,
                       enabled ? kReadable : kDisabled});
    }
    ExpectReadable(stylus.Shot(), texts, "menu " + menu.commands.back());
  }
}

struct DialogCase {
  DialogTemplate form;
  std::vector<std::string> commands;
  bool hasHelp = false;
};

/// What stands in a dialog's caption.
std::vector<Text> CaptionTexts(const DialogCase& dialog) {
  const int width = platform::UnitsAcross(dialog.form.width) + 2;
  const int height = platform::UnitsDown(dialog.form.height) + 21;
  const Point at{(240 - width) / 2, (294 - height) / 2};
  const platform::Font font{kSystemFont.height, true};
  std::vector<Text> texts = {{dialog.form.title, RectAt(at + Point{6, 4}, {1, 1}), font, kWhite}};
  if (dialog.hasHelp) {
    texts.push_back({"?", RectAt(at + Point{width - 32, 4}, {1, 1}), font, kBlack});
  }
  return texts;
}

/// The lines of a control, each somewhere in its rectangle. Where the keyboard works, a list's text
/// is white; so is a marked text.
void AddControlTexts(std::vector<Text>& texts, const Json& control, const platform::CBitmap& shot) {
  const std::string kind = control["kind"];
  const Json& r = control["rect"];
  const Rect place{r[0], r[1], r[2], r[3]};
  std::vector<std::string> lines = {control["text"]};
  if (kind == "static") lines = platform::WrapText(lines[0], place.Width());
  if (kind == "check") lines = platform::WrapText(lines[0], place.Width() - 19);
  for (const std::string& line : lines) {
    Text text{line, place, kSystemFont, kBlack};
    if ((kind == "list" || kind == "edit") && PlacesOf(shot, text).empty()) {
      text.color = kWhite;
      text.corners.right = place.left + 6;  // farther right all is white
    }
    texts.push_back(text);
  }
}

std::vector<DialogCase> Dialogs() {
  const std::string entry = "command 57665";
  return {{SetupTemplate(), {"command 32779"}, true},
          {SetupTemplate(), {"command 32779", "key Tab", "key Tab"}, true},
          {SetupTableTemplate(), {"command 32777"}, true},
          {SetupTableTemplate(), {"command 32777", "select 1005 4"}, true},
          {EditColorTemplate(), {"command 32777", "press 1500"}},
          {HighScoresTemplate(), {"command 32781"}},
          {HighScoresTemplate(), {"wallet 187.5", entry, "type Ann "}},
          {HighScoresTemplate(), {"wallet 187.5", entry, "type Ann ", "key Ctrl+A"}},
          {{"Feltside", 130, 46, {}}, {"wallet 187.5", entry, "press 1"}},
          {AboutTemplate(), {"command 57664"}}};
}

TEST(Contrast, HoldsForTheDialogs) {
  for (const DialogCase& dialog : Dialogs()) {
    Stylus stylus("[Settings]\nHigh0 = \"Hannah 412\"\nHigh1 = \"Joe 150\"");
    const Json state = StateAfter(stylus, dialog.commands);
    ASSERT_EQ(state["windows"].back(), dialog.form.title);
    const platform::CBitmap shot = stylus.Shot();
    std::vector<Text> texts = CaptionTexts(dialog);
    for (const Json& control : state["controls"]) {
      // A patch hides its text in its colour.
      if (control["visible"] && control["kind"] != "patch") AddControlTexts(texts, control, shot);
    }
    ExpectReadable(shot, texts, dialog.form.title + ", " + dialog.commands.back());
  }
}

TEST(Contrast, HoldsForTheOpenLists) {
  for (const auto& [form, command] :
       {std::pair{SetupTemplate(), "command 32779"}, {SetupTableTemplate(), "command 32777"}}) {
    for (const platform::ControlTemplate& list : form.controls) {
      if (list.items.empty()) continue;
      Stylus stylus;
      const Json state = StateAfter(stylus, {command, "press " + std::to_string(list.controlID)});
      std::vector<Text> texts;
      for (const Json& control : state["controls"]) {
        if (control["number"] != list.controlID) continue;
        for (int item = 0; item < static_cast<int>(list.items.size()); ++item) {
          const Point at{control["rect"][0], control["rect"][3]};
          texts.push_back({list.items[static_cast<std::size_t>(item)],
                           RectAt(at + Point{4, 2 + 15 * item}, {1, 1}), kSystemFont,
                           item == control["value"] ? kWhite : kBlack});
        }
      }
      EXPECT_EQ(texts.size(), list.items.size());
      ExpectReadable(stylus.Shot(), texts, "list " + std::to_string(list.controlID));
    }
  }
}

}  // namespace
}  // namespace feltside::tests
