// How every dialog looks, and that all of it can be seen.

#include <gtest/gtest.h>

#include <algorithm>

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
  const char* keys = "";
  std::string settings = {};
  const char* typed = nullptr;  ///< before the keys
};

const std::string kFive =
    "High0 = 'Ann Lee 1250'\nHigh1 = '\u05E9\u05DC\u05D5\u05DD \U0001F600 900'\n"
    "High2 = 'Bob & Co. 300'\nHigh4 = 'Eve 101'\nHigh3 = 'WWWWWWWWWWWWWWWWWWWWWWWWWW 250'\n";
const char* const kLongName = "A name that is longer than a line of the list";
constexpr int kExit = 57665;

const std::vector<Scene> kScenes = {
    {"dialog_about", 57664},
    {"dialog_setup", 32779},
    {"dialog_setup_list", 32779, "Tab Tab F4"},
    {"dialog_table", 32777, "Tab Tab Tab Tab Tab Tab"},
    {"dialog_table_backs", 32777, "Tab Tab F4 M"},
    {"dialog_color", 32777, "Space Tab", "TABLECOLOR = 16744448\n"},  // 0, 128, 255
    {"dialog_scores", 32781, "", kFive},
    {"dialog_scores_entry", kExit},
    {"dialog_scores_long_name", kExit, "Shift+Left Shift+Left", kFive, kLongName},
    {"dialog_scores_added", kExit, "Enter", "", kLongName},
    {"dialog_question", kExit, "Enter"},
};

/// A desk with that dialog on it.
class Stage : public DialogDesk {
 public:
  explicit Stage(const Scene& scene) : DialogDesk("[Settings]\n" + scene.settings) {
    Wallet(250);
    Command(scene.commandID);
    if (scene.typed != nullptr) Type(scene.typed);
    Keys(scene.keys);
  }

  /// What is shown in front of the table.
  platform::CBitmap Front() const {
    const auto& windows = platform::TheApp().Screen().Windows();
    Rect place = windows[1]->GetPlace();
    for (const platform::CTopWindow* window : windows) {
      if (window == windows[0]) continue;
      const Rect other = window->GetPlace();
      place = {std::min(place.left, other.left), std::min(place.top, other.top),
               std::max(place.right, other.right), std::max(place.bottom, other.bottom)};
    }
    platform::CBitmap front({place.Width(), place.Height()});
    platform::CSurface(front).BitBlt({}, front.GetSize(), Shown(), place.TopLeft());
    return front;
  }
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

void ExpectWhole(const Stage& stage) {
  const Rect window = platform::RectAt({}, platform::CScreen::kSize);
  for (const platform::CTopWindow* top : platform::TheApp().Screen().Windows()) {
    EXPECT_TRUE(Holds(window, top->GetPlace())) << top->GetTitle();
  }
  std::vector<Rect> taken;
  for (const auto& control : stage.Dialog()->Controls()) {
    if (!control->IsVisible()) continue;
    SCOPED_TRACE(control->KindName() + (" " + control->GetText()));
    Rect place = stage.Place(*control);
    EXPECT_TRUE(Holds(stage.Dialog()->GetPlace().Shrunk(1), place));
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

TEST(DialogPictures, AreWholeAndAsTheyWere) {
  for (const Scene& scene : kScenes) {
    SCOPED_TRACE(scene.name);
    const Stage stage(scene);
    ExpectWhole(stage);
    ExpectGolden(stage.Front(), scene.name);
  }
}

}  // namespace
}  // namespace feltside::tests
