// What comes into an edit by other ways than keys.

#include <gtest/gtest.h>

#include "platform/draw/look.h"
#include "shell/res/dialog_templates.h"
#include "tests/support/desk.h"
#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

using platform::InputKind;

/// The entry of a name, with the keyboard in its edit.
class NameEdit : public testing::Test {
 protected:
  NameEdit() {
    m_desk.Table().SetWallet(250);
    m_desk.Command(platform::kCommandExit);
  }

  void Put(InputKind kind, const std::string& text, platform::Point at = {}) {
    m_desk.Host().PutInput({kind, at, 0, {}, text});
    m_desk.Run();
  }
  void PutKeys(const std::vector<std::string>& keys) {
    for (const std::string& key : keys) m_desk.Host().PutKey(key);
    m_desk.Run();
  }
  platform::CControl& Edit() { return *m_desk.Dialog()->GetDlgItem(kScoresName); }
  /// Where the host was told that the caret stands, within the edit.
  platform::Rect CaretPlace() {
    const platform::Rect place = m_desk.Host().TextPlace().value();
    return place.Moved(platform::Point{} - Edit().ScreenOrigin());
  }

  Desk m_desk;
};

TEST_F(NameEdit, MakesOneLineOfLettersOfAPaste) {
  const std::vector<std::pair<std::string, std::string>> cases = {
      {"one\r\ntwo\nthree\tfour", "one two three four"},
      {"o\xFFk\xC3\xE2\x82\xAC\xF0\x9F", "ok\u20AC"},
      {"\" \\ = [x]", "\" \\ = [x]"},
      {std::string(100000, 'm'), std::string(100000, 'm')}};
  for (const auto& [pasted, text] : cases) {
    m_desk.Host().SetClipboard(pasted);
    PutKeys({"Ctrl+A", "Ctrl+V"});
    EXPECT_EQ(Edit().GetText(), text);
  }
}

TEST_F(NameEdit, TakesWhatIsMarkedElsewhereWhereTheMiddleButtonPoints) {
  Put(InputKind::kText, "WWWW");
  PutKeys({"Shift+Home"});
  const platform::Rect place = Edit().GetPlace();
  const platform::Point middle = Edit().ScreenOrigin() + platform::Point{24, place.Height() / 2};
  Put(InputKind::kMiddleClick, "one\ntwo", middle);
  EXPECT_EQ(Edit().GetText(), "WWone twoWW");
  Put(InputKind::kMiddleClick, "three", {30, 30});
  EXPECT_EQ(Edit().GetText(), "WWone twoWW");
}

TEST_F(NameEdit, ShowsACompositionWhereItWillStand) {
  Put(InputKind::kText, "Annae");
  const int end = 4 + MeasureText(platform::kSystemFont, "Annae").width;
  EXPECT_EQ(CaretPlace(), (platform::Rect{end - 1, 0, end, Edit().GetPlace().Height()}));
  PutKeys({"Left", "Left", "Shift+Right"});
  const platform::Rect before = CaretPlace();
  Put(InputKind::kComposition, "");
  EXPECT_EQ(Edit().GetText(), "Annae");
  Put(InputKind::kComposition, "Mari");
  // It takes the place of what was marked; the name has not got it yet.
  EXPECT_EQ(Edit().GetText(), "Anne");
  EXPECT_LT(CaretPlace().left, before.left);
  EXPECT_GT(CaretPlace().Width(), before.Width());
  ExpectGolden(m_desk.Host().Shown(), "dialog_scores_composition");
  Put(InputKind::kComposition, "");
  EXPECT_EQ(CaretPlace().Width(), before.Width());
  Put(InputKind::kComposition, "\u307e");
  Put(InputKind::kText, "\u9ebb\u7406");
  EXPECT_EQ(Edit().GetText(), "Ann\u9ebb\u7406e");
  EXPECT_EQ(CaretPlace().Width(), before.Width());
}

TEST_F(NameEdit, KeepsTheCaretInSight) {
  Put(InputKind::kText, std::string(50, 'm'));
  for (const char* key : {"Home", "Shift+End", "Shift+Home", "End", "Shift+Left", "Ctrl+A"}) {
    PutKeys({key});
    EXPECT_FALSE(CaretPlace().IsEmpty()) << key;
  }
}

}  // namespace
}  // namespace feltside::tests
