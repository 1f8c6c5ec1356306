// How every dialog looks, and that all of it can be seen.

#include <gtest/gtest.h>

#include "platform/look.h"
#include "platform/screen.h"
#include "platform/wrapped_text.h"
#include "tests/shell/dialog_desk.h"
#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

using platform::CControl;
using platform::Rect;

struct Scene {
  const char* name;
  int commandID;
  std::vector<std::string> keys = {};
  std::string settings = {};
};

const std::string kFive =
    "High0 = 'Ann Lee 1250'\nHigh1 = '\u05E9\u05DC\u05D5\u05DD \U0001F600 900'\n"
    "High2 = 'Bob & Co. 300'\nHigh4 = 'Eve 101'\nHigh3 = 'WWWWWWWWWWWWWWWWWWWWWWWWWW 250'\n";
constexpr int kExit = 57665;

const std::vector<Scene> kScenes = {
    {"dialog_about", 57664},
    {"dialog_setup", 32779},
    {"dialog_setup_list", 32779, {"Tab", "Tab", "F4"}},
    {"dialog_table", 32777, {"Tab", "Tab", "Tab", "Tab", "Tab", "Tab"}},
    {"dialog_table_backs", 32777, {"Tab", "Tab", "F4", "M"}},
    {"dialog_color", 32777, {"Space", "Tab"}, "TABLECOLOR = 16744448\n"},  // 0, 128, 255
    {"dialog_scores", 32781, {}, kFive},
    {"dialog_scores_entry", kExit},
    {"dialog_scores_long_name",
     kExit,
     {"'A name that is longer than the box", "Shift+Left", "Shift+Left"},
     kFive},
    {"dialog_scores_added", kExit, {"'A name that is longer than a line of the list", "Enter"}},
    {"dialog_question", kExit, {"Enter"}},
};

class Pictures : public testing::TestWithParam<Scene> {
 protected:
  Pictures() : m_desk("[Settings]\n" + GetParam().settings) {
    m_desk.Wallet(250);
    m_desk.Command(GetParam().commandID);
    m_desk.Keys(GetParam().keys);
  }

  DialogDesk m_desk;
};

bool Holds(const Rect& outer, const Rect& inner) { return outer.Common(inner) == inner; }

/// Whether a control's text has room beside and below what else the control shows.
bool HasRoom(const CControl& control) {
  const std::string kind = control.KindName();
  const int other = kind == "button" ? 4 : kind == "check" ? 19 : kind == "list" ? 21 : 0;
  const Rect client = control.GetClientRect();
  const auto lines = platform::WrapText(control.GetText(), client.right - other);
  bool fits = static_cast<int>(lines.size()) * platform::kSystemFont.height <= client.bottom;
  for (const std::string& line : lines) {
    const std::string text = platform::WithoutMnemonic(line);
    fits = fits && MeasureText(platform::kSystemFont, text).width <= client.right - other;
  }
  return fits;
}

TEST_P(Pictures, AreWhole) {
  const Rect window = platform::RectAt({}, platform::CScreen::kSize);
  for (const platform::CTopWindow* top : platform::TheApp().Screen().Windows()) {
    EXPECT_TRUE(Holds(window, top->GetPlace())) << top->GetTitle();
  }
  std::vector<Rect> taken;
  for (const auto& control : m_desk.Dialog()->Controls()) {
    if (!control->IsVisible()) continue;
    SCOPED_TRACE(control->KindName() + (" " + control->GetText()));
    Rect place = m_desk.Place(*control);
    EXPECT_TRUE(Holds(m_desk.Dialog()->GetPlace().Shrunk(1), place));
    const bool listLine = control->GetID() >= 6009 && control->GetID() <= 6013;
    const std::string kind = control->KindName();
    // What is too long for a list line or an edit is cut there, and a patch shows no text.
    EXPECT_TRUE(listLine || kind == "edit" || kind == "patch" || HasRoom(*control));
    if (kind == "group") continue;
    if (kind == "static") ++place.top;  // no letter reaches that high
    for (const Rect& other : taken) EXPECT_TRUE(place.Common(other).IsEmpty());
    taken.push_back(place);
  }
}

TEST_P(Pictures, AreAsTheyWere) { ExpectGolden(m_desk.Shown(), GetParam().name); }

INSTANTIATE_TEST_SUITE_P(Dialogs, Pictures, testing::ValuesIn(kScenes),
                         [](const auto& test) { return std::string(test.param.name); });

}  // namespace
}  // namespace feltside::tests
