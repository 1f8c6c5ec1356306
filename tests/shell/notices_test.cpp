// Trouble is told once, in a box that names it, and never in the midst of a deal.

#include <gtest/gtest.h>

#include "table/command_ids.h"
#include "tests/support/desk.h"

namespace feltside::tests {
namespace {

/// The text of the topmost box; empty where there is no box with one text and OK.
std::string BoxText(const Desk& desk) {
  const platform::CDialog* dialog = desk.Dialog();
  if (dialog == nullptr || dialog->Controls().size() != 2) return "";
  return dialog->Controls()[0]->GetText();
}

std::size_t OpenWindows() { return platform::TheApp().Screen().Windows().size(); }

void Press(Desk& desk, const std::vector<std::string>& keys) {
  for (const std::string& key : keys) desk.Host().PutKey(key);
  desk.Run();
}

TEST(Notices, AreShownOnceBetweenDeals) {
  Desk desk;
  desk.Host().SetHelpTrouble("No help.");
  desk.Table().Stack({10, 9, 10, 8});
  desk.Command(kCommandDeal);
  Press(desk, {"F1"});
  platform::TheApp().Notify("No disk.");
  desk.Run();
  EXPECT_EQ(OpenWindows(), 1U);
  Press(desk, {"S"});
  EXPECT_EQ(BoxText(desk), "No help.");
  // The next one waits until the first was read.
  Press(desk, {"Enter"});
  EXPECT_EQ(BoxText(desk), "No disk.");
  Press(desk, {"Enter", "F1"});
  EXPECT_EQ(OpenWindows(), 1U);
}

TEST(Notices, StandOverTheDialogThatAsked) {
  Desk desk;
  desk.Host().SetHelpTrouble("No help.");
  desk.Command(kCommandTableSetup);
  Press(desk, {"F1"});
  EXPECT_EQ(BoxText(desk), "No help.");
  Press(desk, {"Enter"});
  EXPECT_EQ(OpenWindows(), 2U);
}

TEST(Notices, AreShownAtTheEndAtTheLatest) {
  Desk desk;
  desk.Table().Stack({10, 9, 10, 8});
  desk.Command(kCommandDeal);
  platform::TheApp().Notify("No disk.");
  Press(desk, {"Ctrl+Q"});
  EXPECT_EQ(BoxText(desk), "No disk.");
  desk.Host().PutKey("Enter");
  EXPECT_FALSE(desk.Run());
}

TEST(Notices, TellOfSettingsThatCannotBeReadOrKept) {
  Desk desk("[broken");
  const std::string file = (desk.Host().ProfileFolder() / "Quillworks" / "Feltside.toml").string();
  EXPECT_EQ(BoxText(desk).find("The settings"), 0U);
  EXPECT_NE(BoxText(desk).find(file), std::string::npos);
  Press(desk, {"Enter"});
  std::filesystem::remove_all(desk.Host().ProfileFolder() / "Quillworks");
  WriteFile(desk.Host().ProfileFolder() / "Quillworks", "in the way of a folder");
  desk.Command(kCommandTableSetup);
  Press(desk, {"Shift+Tab", "Shift+Tab", "Enter"});
  EXPECT_NE(BoxText(desk).find(file), std::string::npos);
  // Once things are in order again, the same trouble is news.
  Press(desk, {"Enter"});
  for (const bool inTheWay : {false, true}) {
    std::filesystem::remove_all(desk.Host().ProfileFolder() / "Quillworks");
    if (inTheWay) WriteFile(desk.Host().ProfileFolder() / "Quillworks", "again");
    desk.Command(kCommandTableSetup);
    Press(desk, {"Shift+Tab", "Shift+Tab", "Enter"});
    EXPECT_EQ(BoxText(desk).find(file) != std::string::npos, inTheWay);
  }
}

TEST(Notices, TellOfAnEndThatKeepsNothing) {
  Desk desk;
  WriteFile(desk.Host().ProfileFolder() / "Quillworks", "in the way of a folder");
  desk.Host().SetWindowPlace({{1, 2, 300, 400}, false});
  desk.Host().PutPointer(platform::InputKind::kClose, {});
  EXPECT_TRUE(desk.Run());
  EXPECT_EQ(BoxText(desk).find("The settings"), 0U);
}

TEST(Notices, LetTheWindowBeClosed) {
  Desk desk;
  platform::TheApp().Notify("No disk.");
  desk.Run();
  platform::TheApp().Notify("No paper.");
  desk.Host().PutPointer(platform::InputKind::kClose, {});
  EXPECT_TRUE(desk.Run());
  EXPECT_EQ(BoxText(desk), "No paper.");
  desk.Host().PutPointer(platform::InputKind::kClose, {});
  EXPECT_FALSE(desk.Run());
}

}  // namespace
}  // namespace feltside::tests
