// The controls and the dialog around them, worked as a person does: at pixels and by keys.

#include <gmock/gmock.h>

#include "platform/look.h"
#include "platform/slider.h"
#include "tests/shell/dialog_desk.h"

namespace feltside::tests {
namespace {

using platform::Point;
using platform::Rect;
using testing::ElementsAre;
using testing::SizeIs;

constexpr int kExit = 57665;
constexpr int kAbout = 57664;
constexpr int kDeal = 32776;
constexpr int kTableSetup = 32777;
constexpr int kGameSetup = 32779;

class Controls : public testing::Test {
 protected:
  int Value(int controlID) { return m_desk.Control(controlID).GetValue(); }
  /// The middle of an item's line in the open list below a combo box.
  Point Item(int controlID, int item) {
    const Rect line = m_desk.Place(m_desk.Control(controlID));
    return {line.left + 20, line.bottom + 1 + 15 * item + 7};
  }
  void OpenEntry() {
    m_desk.Wallet(250);
    m_desk.Command(kExit);
  }
  void OpenColor() {
    m_desk.Command(kTableSetup);
    m_desk.Tap(m_desk.Middle(1502));  // red 135, green 180, blue 100
  }
  platform::CSlider& Slider(int controlID) {
    return m_desk.Dialog()->Item<platform::CSlider>(controlID);
  }
  Point Thumb(int controlID, int value) {
    return Slider(controlID).ScreenOrigin() + Slider(controlID).ThumbMiddle(value);
  }
  std::vector<int> TabRound(const std::string& key) {
    std::vector<int> stops;
    do {
      stops.push_back(m_desk.Focus());
      m_desk.Keys(key);
    } while (m_desk.Focus() != stops.front() && stops.size() < 20);
    return stops;
  }

  DialogDesk m_desk;
};

TEST_F(Controls, AButtonActsWhereItIsReleased) {
  m_desk.Command(kGameSetup);
  const Point cancel = m_desk.Middle(2);
  const Point beside{cancel.x, cancel.y - 30};
  m_desk.Press(cancel);
  m_desk.Move(beside);
  m_desk.Release(beside);
  m_desk.Press(beside);
  m_desk.Release(cancel);
  EXPECT_THAT(m_desk.Windows(), ElementsAre("Feltside", "Setup"));
  m_desk.Press(cancel);
  m_desk.Move(beside);
  m_desk.Move(cancel);
  m_desk.Release(cancel);
  EXPECT_THAT(m_desk.Windows(), ElementsAre("Feltside"));
}

TEST_F(Controls, APressIsLostWhenADialogOpensMeanwhile) {
  m_desk.Command(kTableSetup);
  const Point button = m_desk.Middle(1502);
  m_desk.Press(button);
  m_desk.Keys("Space");
  m_desk.Release(button);
  EXPECT_THAT(m_desk.Windows(), ElementsAre("Feltside", "Setup Table", "Edit RGB Color"));
}

TEST_F(Controls, ABoxIsTickedByAPressOnItOrItsTextAndBySpace) {
  m_desk.Command(kTableSetup);
  const Rect box = m_desk.Place(m_desk.Control(1013));
  m_desk.Tap({box.left + 3, box.top + 12});
  EXPECT_EQ(Value(1013), 1);
  m_desk.Tap({box.right - 30, box.top + 12});
  EXPECT_EQ(Value(1013), 0);
  m_desk.Press({box.left + 3, box.top + 12});
  m_desk.Release({box.left + 3, box.bottom + 3});
  EXPECT_EQ(Value(1013), 0);
  m_desk.Keys("Space Space Space");
  EXPECT_EQ(Value(1013), 1);
}

TEST_F(Controls, AListIsWorkedByTheStylus) {
  m_desk.Command(kTableSetup);
  const Point line = m_desk.Middle(1005);
  m_desk.Tap(line);
  EXPECT_THAT(m_desk.Windows(), ElementsAre("Feltside", "Setup Table", ""));
  m_desk.Tap(Item(1005, 4));
  EXPECT_EQ(Value(1005), 4);
  EXPECT_EQ(m_desk.Control(1005).GetText(), "Dirty Yellow ");
  m_desk.Press(line);  // in one stroke
  m_desk.Move(Item(1005, 9));
  m_desk.Release(Item(1005, 7));
  EXPECT_EQ(Value(1005), 7);
  EXPECT_THAT(m_desk.Windows(), SizeIs(2));
  for (const Point beside : {m_desk.Middle(1), line, Point{120, 13}}) {
    m_desk.Tap(line);
    m_desk.Tap(beside);  // only closes it
    EXPECT_THAT(m_desk.Windows(), ElementsAre("Feltside", "Setup Table"));
  }
  EXPECT_EQ(Value(1005), 7);
  m_desk.Wheel(line, -2);
  EXPECT_EQ(Value(1005), 9);
  m_desk.Wheel(line, 99);
  EXPECT_EQ(Value(1005), 0);
  m_desk.Tap(line);
  m_desk.Wheel(Item(1005, 3), -3);
  EXPECT_EQ(Value(1005), 0);  // not before it is chosen
  m_desk.Keys("Enter");
  EXPECT_EQ(Value(1005), 3);
}

struct KeyCase {
  const char* keys;
  int value;
};

TEST_F(Controls, AListIsWorkedByKeys) {
  m_desk.Command(kTableSetup);
  m_desk.Keys("Tab Tab");
  const std::vector<KeyCase> cases = {
      // clang-format off
      {"Down", 1}, {"Up Up", 0}, {"End", 11}, {"Down", 11}, {"Home", 0}, {"B", 1}, {"B", 6},
      {"B", 8}, {"B", 0}, {"Q", 0}, {"F4 S Enter", 3}, {"F4 Down Escape", 3},
      {"Alt+Down End Space", 11}, {"Space P Tab", 2}, {"F4 PageDown F4", 11},
      {"F4 PageUp Home Up Enter", 0},
      // clang-format on
  };
  for (const KeyCase& test : cases) {
    m_desk.Keys(test.keys);
    EXPECT_EQ(Value(1005), test.value) << test.keys;
    EXPECT_THAT(m_desk.Windows(), ElementsAre("Feltside", "Setup Table"));
  }
}

TEST_F(Controls, ASliderIsDraggedAndPressedBesideItsThumb) {
  OpenColor();
  const Point grip = Thumb(6001, 180) + Point{3, 2};
  m_desk.Press(grip);
  m_desk.Move(grip);
  m_desk.Move(grip + Point{2, 0});
  EXPECT_EQ(Value(6001), 180);  // not before the thumb moves
  m_desk.Move({grip.x + 60, 0});
  EXPECT_EQ(Value(6001), 0);
  m_desk.Move({grip.x, 293});
  EXPECT_EQ(Value(6001), 255);
  m_desk.Move(grip + Point{0, -10});
  const int value = Value(6001);
  EXPECT_NEAR(Thumb(6001, value).y, Thumb(6001, 180).y - 10, 1);
  m_desk.Release(grip + Point{0, -10});
  m_desk.Move(grip);
  EXPECT_EQ(Value(6001), value);
  const Rect channel = m_desk.Place(Slider(6002));
  const Point above{channel.left + 10, channel.top + 1};
  const Point below{channel.left + 10, channel.bottom - 2};
  const auto valueAfterTap = [this](Point at) {
    m_desk.Tap(at);
    return Value(6002);
  };
  EXPECT_EQ(valueAfterTap(below), 150);
  EXPECT_EQ(valueAfterTap(above), 100);
  EXPECT_EQ(valueAfterTap(above), 50);
  m_desk.Wheel(below, 1);
  EXPECT_EQ(Value(6002), 40);
  EXPECT_EQ(valueAfterTap(above), 0);
}

TEST_F(Controls, ASliderIsMovedByKeys) {
  OpenColor();
  const std::vector<KeyCase> cases = {{"Up", 125},       {"Left", 115},     {"Down Right", 135},
                                      {"PageDown", 185}, {"PageUp", 135},   {"End", 255},
                                      {"Down", 255},     {"PageDown", 255}, {"Up", 245},
                                      {"Home", 0},       {"PageUp", 0},     {"Down", 10}};
  for (const KeyCase& test : cases) {
    m_desk.Keys(test.keys);
    EXPECT_EQ(Value(6000), test.value) << test.keys;
    EXPECT_EQ(m_desk.Control(6003).GetText(), std::to_string(test.value));
  }
}

struct EditCase {
  const char* keys;
  std::string text;
  std::string clipboard = {};  ///< beforehand
};

TEST_F(Controls, AnEditIsTypedInto) {
  const std::vector<EditCase> cases = {
      {"'abc Home Delete End Backspace", "b"},
      {"'abc Left Left 'X Right 'Y", "aXbYc"},
      {"'abc Home Backspace Left End Delete Right", "abc"},
      {"'abcd Shift+Left Shift+Left 'X", "abX"},
      {"'abcd Shift+Home Delete", ""},
      {"'abcd Home Shift+End 'Z", "Z"},
      {"'abcd Home Shift+Right Shift+Right Left 'X", "Xabcd"},
      {"'abcd Home Shift+Right Shift+Right Right 'X", "abXcd"},
      {"'abcd Ctrl+A Ctrl+C End Ctrl+V", "abcdabcd"},
      {"'abcd Shift+Left Ctrl+X Home Ctrl+V", "dabc"},
      {"'abcd Shift+Left Ctrl+Insert Home Shift+Insert", "dabcd"},
      {"'abcd Shift+Left Shift+Delete Home Shift+Insert", "dabc"},
      {"'ab Ctrl+C Ctrl+X Ctrl+V", "abkept", "kept"},
      {"'a\u00E9\u20AC\U0001F600 Backspace", "a\u00E9\u20AC"},
      {"'a\u00E9\u20AC\U0001F600 Left Backspace", "a\u00E9\U0001F600"},
      {"'a\u00E9\u20AC\U0001F600 Home Right Delete Delete", "a\U0001F600"},
      {"'\u05E9\u05DC Shift+Left Ctrl+X Home Ctrl+V", "\u05DC\u05E9"},
      {"Ctrl+V", "one two three four", "one\r\ntwo\nthree\tfour"},
      {"Ctrl+V", "ok\u20AC", "o\xFFk\xC3\xE2\x82\xAC\xF0\x9F"},
      {"Ctrl+V Space", "\" \\ = [x]", "\" \\ = [x]"},  // a key types nothing, its text does
  };
  OpenEntry();
  for (const EditCase& test : cases) {
    m_desk.Host().SetClipboard(test.clipboard);
    m_desk.Keys("Ctrl+A Delete");
    m_desk.Keys(test.keys);
    EXPECT_EQ(m_desk.Control(6016).GetText(), test.text) << test.keys;
  }
}

TEST_F(Controls, AnEditIsMarkedByTheStylus) {
  OpenEntry();
  m_desk.Keys("'WWiWW");
  const Rect box = m_desk.Place(m_desk.Control(6016));
  const auto after = [&box](const std::string& text) {
    return Point{box.left + 4 + MeasureText(platform::kSystemFont, text).width, box.top + 10};
  };
  m_desk.Press(after("WW"));
  m_desk.Move(after("WWi"));
  m_desk.Release(after("WWi"));
  m_desk.Keys("Ctrl+X");
  EXPECT_EQ(m_desk.Host().GetClipboard(), "i");
  m_desk.Tap(after("W"));
  m_desk.Type("-");
  m_desk.Tap({box.right - 2, box.top + 10});
  m_desk.Type("!");
  EXPECT_EQ(m_desk.Control(6016).GetText(), "W-WWW!");
  // A long text has moved to the left: the box begins with another letter.
  m_desk.Type(std::string(40, 'm'));
  m_desk.Tap({box.left + 1, box.top + 10});
  m_desk.Keys("Shift+Home Delete");
  const std::string rest = m_desk.Control(6016).GetText();
  EXPECT_EQ(rest, std::string(rest.size(), 'm'));
  EXPECT_LT(MeasureText(platform::kSystemFont, rest).width, box.Width() + 12);
}

TEST_F(Controls, AnswersToAQuestionAreNotTyped) {
  OpenEntry();
  EXPECT_TRUE(m_desk.Host().WantsText());
  for (const char* answer : {"N", "Alt+N", "Escape"}) {
    m_desk.Keys("Enter");
    EXPECT_EQ(m_desk.Dialog()->GetTitle(), "Feltside");
    EXPECT_FALSE(m_desk.Host().WantsText());  // so the machine sends no letter after the key
    m_desk.Keys(answer);
    EXPECT_EQ(m_desk.Dialog()->GetTitle(), "High Scores");
    EXPECT_EQ(m_desk.Focus(), 6016);
    EXPECT_TRUE(m_desk.Host().WantsText());
  }
  m_desk.Keys("Enter Y");
  EXPECT_FALSE(m_desk.IsRunning());
}

TEST_F(Controls, TabGoesRoundAndBackwards) {
  const std::vector<std::pair<int, std::vector<int>>> cases = {
      {kGameSetup, {1000, 1007, 1008, 1009, 1, 2}},
      {kTableSetup, {1500, 1502, 1005, 1012, 1014, 1010, 1013, 1, 2}},
      {kAbout, {0}},
      {kExit, {6016, 1011, 1}}};
  m_desk.Wallet(250);
  for (const auto& [commandID, stops] : cases) {
    m_desk.Command(commandID);
    EXPECT_EQ(TabRound("Tab"), stops);
    std::vector<int> backwards(stops.rbegin(), stops.rend());
    std::rotate(backwards.begin(), backwards.end() - 1, backwards.end());
    EXPECT_EQ(TabRound("Shift+Tab"), backwards);
    if (commandID != kExit) m_desk.Keys("Escape");
  }
  m_desk.Control(1011).EnableWindow(false);
  EXPECT_THAT(TabRound("Tab"), ElementsAre(6016, 1));
}

TEST_F(Controls, EnterMeansTheFocusedButtonElseTheDefaultOne) {
  m_desk.Command(kGameSetup);
  m_desk.Keys("Shift+Tab Enter");  // on Cancel
  EXPECT_EQ(m_desk.Table()["m_bHandInProgress"], 0);
  EXPECT_THAT(m_desk.Windows(), SizeIs(1));
  m_desk.Command(kGameSetup);
  m_desk.Keys("Enter");
  EXPECT_NE(m_desk.Table()["m_handPlayer"].size(), 0U);
  for (const char* key : {"Enter", "Escape"}) {
    m_desk.Command(kAbout);
    EXPECT_THAT(m_desk.Windows(), ElementsAre("Feltside", "About Feltside"));
    m_desk.Keys(key);
    EXPECT_THAT(m_desk.Windows(), ElementsAre("Feltside"));
  }
}

TEST_F(Controls, HelpIsAskedForByKeyOrSign) {
  const auto sign = [this] {
    const Rect dialog = m_desk.Dialog()->GetPlace();
    return Point{dialog.right - 28, dialog.top + 10};
  };
  m_desk.Command(kGameSetup);
  m_desk.Keys("F1");
  m_desk.Press(sign());
  m_desk.Release(sign() + Point{-30, 0});  // slid off
  m_desk.Keys("Escape");
  m_desk.Command(kTableSetup);
  m_desk.Tap(sign());
  m_desk.Tap(m_desk.Middle(1500));
  m_desk.Keys("F1");  // the colours have no topic
  m_desk.Tap(sign());
  EXPECT_THAT(m_desk.Host().HelpCalls(),
              ElementsAre("file:cardroom.htm#game_setup", "file:cardroom.htm#table_setup"));
}

TEST_F(Controls, ADialogIsMovedByItsCaptionWithinTheWindow) {
  m_desk.Command(kGameSetup);
  const Rect before = m_desk.Dialog()->GetPlace();
  const Point grip{before.left + 40, before.top + 8};
  const auto placeAfter = [&](Point to) {
    m_desk.Move(to);
    return m_desk.Dialog()->GetPlace();
  };
  m_desk.Press(grip);
  EXPECT_EQ(placeAfter(grip + Point{3, -4}), before.Moved({3, -4}));
  EXPECT_EQ(placeAfter(grip + Point{5, 6}), before.Moved({5, 6}));
  EXPECT_EQ(placeAfter({-500, -500}).TopLeft(), Point());
  const Rect corner = placeAfter({900, 900});
  EXPECT_EQ((Point{corner.right, corner.bottom}), (Point{240, 294}));
  m_desk.Release({900, 900});
  EXPECT_EQ(placeAfter({0, 0}), corner);
  EXPECT_THAT(m_desk.Windows(), SizeIs(2));
  const Point cross{corner.right - 11, corner.top + 10};
  m_desk.Press(cross);
  m_desk.Release(cross + Point{0, 40});
  EXPECT_THAT(m_desk.Windows(), SizeIs(2));
  m_desk.Tap(cross);
  EXPECT_THAT(m_desk.Windows(), SizeIs(1));
}

TEST_F(Controls, TheFrameBehindADialogIsDead) {
  const Json before = m_desk.Table();
  m_desk.Command(kGameSetup);
  for (int x = 2; x < 240; x += 8) m_desk.Tap({x, 12});  // menu, tool bar, close button
  m_desk.Tap({3, 200});
  m_desk.Keys("Ctrl+N F10 Alt+B");
  for (const int commandID : {kDeal, kExit, kAbout, kTableSetup}) m_desk.Command(commandID);
  EXPECT_EQ(m_desk.Table(), before);
  EXPECT_THAT(m_desk.Windows(), ElementsAre("Feltside", "Setup"));
  m_desk.Keys("Escape");
  m_desk.Command(kDeal);
  EXPECT_NE(m_desk.Table(), before);
}

}  // namespace
}  // namespace feltside::tests
