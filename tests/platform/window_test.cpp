// The windows of the layer by themselves, without the game.

#include <gtest/gtest.h>

#include "platform/dialog/combo_box.h"
#include "platform/dialog/message_box.h"
#include "platform/draw/look.h"
#include "platform/draw/wrapped_text.h"
#include "platform/window/application.h"
#include "tests/support/desk.h"

namespace feltside::tests {
namespace {

using platform::InputKind;

constexpr platform::Size kScreen{240, 294};

/// A program that does one thing and ends.
class App : public platform::CApplication {
 public:
  explicit App(std::function<void()> act)
      : CApplication("Test", {}, kScreen), m_fnAct(std::move(act)) {}

 protected:
  bool InitInstance() override {
    m_fnAct();
    return false;
  }
  bool CanShowNotice() const override { return false; }
  void ShowNotice(const std::string&) override {}

 private:
  std::function<void()> m_fnAct;
};

TEST(Screen, TakesInputWithNoWindowOpen) {
  platform::CScreen screen(kScreen);
  for (int kind = 0; kind <= static_cast<int>(InputKind::kClose); ++kind) {
    screen.HandleInput({static_cast<InputKind>(kind), {}, 1, {}, {}});
  }
}

TEST(Screen, IsShownWholeWithASmallWindowAlone) {
  DeskHost host;
  host.SetFrameHandler([&host] { EXPECT_EQ(host.Shown().GetSize(), kScreen); });
  App([] { platform::MessageBox("Too early"); }).Main();
  EXPECT_EQ(host.Shown().GetSize(), kScreen);
}

class OneList : public platform::CDialog {
 public:
  OneList()
      : CDialog({"", 100, 100, {{platform::ControlKind::kComboBox, 7, "", {5, 5, 90, 60}}}}) {}
  void OnSelChange(int) override { ADD_FAILURE(); }
};

TEST(ComboBox, HasNothingToChooseWhileItIsEmpty) {
  DeskHost host;
  for (const char* key : {"Down", "Up", "Home", "End", "A", "F4", "Down", "End", "Enter"}) {
    host.PutKey(key);
  }
  App([] {
    OneList dialog;
    dialog.DoModal();
    EXPECT_EQ(dialog.GetDlgItem(7)->GetValue(), -1);
  }).Main();
}

TEST(Menu, KnowsAnItemByItsMarkedLetterElseByItsFirst) {
  for (const auto& [text, letter] : std::vector<std::pair<std::string, char>>{
           {"E&xit", 'X'}, {"Help...", 'H'}, {"help", 'H'}, {"7 up", '7'}, {"", 0}}) {
    EXPECT_EQ(platform::LetterOf(text), letter) << text;
  }
}

TEST(WrapText, BreaksWhatIsWiderThanTheLineBehindASlashOrALetter) {
  struct Case {
    std::string text;
    std::string widest;  ///< what just fits a line
    std::vector<std::string> lines;
  };
  for (const Case& c :
       {Case{"in one line", "in one line", {"in one line"}},
        {"two words that do not fit", "do not fit", {"two", "words", "that do", "not fit"}},
        {"See /home/of/a/long.name", "/home/of/", {"See", "/home/of/", "a/", "long.nam", "e"}},
        {"mmmmmmm no", "mmmm", {"mmmm", "mmm", "no"}},
        {"/ab", "/", {"/", "a", "b"}},
        {"", "", {""}}}) {
    EXPECT_EQ(platform::WrapText(c.text, MeasureText(platform::kSystemFont, c.widest).width),
              c.lines);
  }
}

}  // namespace
}  // namespace feltside::tests
