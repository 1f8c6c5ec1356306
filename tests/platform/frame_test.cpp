// The road of a message: the queue, the windows that input finds, the routing of commands, and the
// command bar with its menu.

#include <gmock/gmock.h>

#include "platform/look.h"
#include "tests/platform/bench_program.h"
#include "tests/support/desk.h"

namespace feltside::tests {
namespace {

using platform::InputKind;
using platform::Message;
using platform::MessageKind;
using platform::Point;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr Point kView{50, 150};
constexpr Point kViewTap{50, 124};  // the same in the view's own pixels
constexpr Point kMenuTitle{12, 12};
constexpr Point kCloseButton{228, 12};

class FrameTest : public testing::Test {
 protected:
  FrameTest() { m_desk.RunUntilIdle(); }

  BenchProgram& Program() { return m_desk.Program(); }
  std::vector<std::string> LogOf(const std::vector<std::pair<InputKind, Point>>& pointer) {
    for (const auto& [kind, at] : pointer) m_desk.Host().PutPointer(kind, at);
    m_desk.RunUntilIdle();
    return Program().TakeLog();
  }
  std::vector<std::string> LogOfTap(Point at) {
    return LogOf({{InputKind::kPointerDown, at}, {InputKind::kPointerUp, at}});
  }
  std::vector<std::string> LogOfKeys(const std::vector<std::string>& chords) {
    for (const std::string& chord : chords) m_desk.Host().PutKey(chord);
    m_desk.RunUntilIdle();
    return Program().TakeLog();
  }
  bool IsMenuOpen() { return Program().Screen().Windows().size() == 2; }
  /// A place on a line of the menu, which need not be open yet.
  static Point MenuLine(int line) { return {20, 27 + 20 * line + (line > 1 ? -13 : 0) + 10}; }
  static Point ToolButton(int button) {
    const int title = MeasureText(platform::kSystemFont, "File").width + 8;
    return {2 + title + 5 + button * 29 + 12, 13};
  }

  Desk<BenchProgram> m_desk;
};

TEST_F(FrameTest, QueueHandsOutTheOldestFirst) {
  platform::CMessageQueue queue;
  Message message;
  EXPECT_FALSE(queue.Peek(message));
  queue.PostCommand(7);
  m_desk.Host().PutKey("A");
  m_desk.Host().PutPointer(InputKind::kClose, {});
  queue.PostQuit(3);  // what has come as input is collected only when it is asked for
  const auto kinds = [&] {
    std::vector<MessageKind> found;
    while (queue.Peek(message)) found.push_back(message.kind);
    return found;
  };
  EXPECT_THAT(kinds(), ElementsAre(MessageKind::kCommand, MessageKind::kQuit, MessageKind::kInput,
                                   MessageKind::kClose));
}

TEST_F(FrameTest, CommandsGoToTheViewThenTheFrameThenTheProgram) {
  for (const int commandID : {kViewCommand, kFrameCommand, kProgramCommand, kNobodysCommand}) {
    Program().Queue().PostCommand(commandID);
  }
  m_desk.RunUntilIdle();
  EXPECT_THAT(Program().TakeLog(), ElementsAre("run 101", "frame runs 103", "program runs 104"));
}

TEST_F(FrameTest, CommandsAreAskedAgainBeforeTheyRun) {
  for (const int commandID : {kViewCommand, kDisablingCommand, kViewCommand, kViewCommand}) {
    EXPECT_TRUE(Program().MainFrame()->IsCommandEnabled(commandID));
    Program().Queue().PostCommand(commandID);
  }
  m_desk.RunUntilIdle();
  EXPECT_THAT(Program().TakeLog(), ElementsAre("run 101", "run 102"));
  EXPECT_FALSE(Program().MainFrame()->IsCommandEnabled(kViewCommand));
  EXPECT_FALSE(Program().MainFrame()->ExecuteCommand(kViewCommand));
}

TEST_F(FrameTest, ADisabledFrameRunsNothing) {
  Program().MainFrame()->EnableWindow(false);
  Program().Queue().PostCommand(kViewCommand);
  Program().Queue().PostCommand(kProgramCommand);
  EXPECT_THAT(LogOfTap(kView), IsEmpty());
  EXPECT_THAT(LogOfTap(ToolButton(1)), IsEmpty());
  EXPECT_THAT(LogOfKeys({"K", "Ctrl+N", "F10"}), IsEmpty());
  EXPECT_FALSE(IsMenuOpen());
  Program().MainFrame()->EnableWindow(true);
  EXPECT_THAT(LogOfKeys({"K", "Ctrl+N"}), ElementsAre("key K", "run 101"));
}

TEST_F(FrameTest, InputFindsTheVisibleEnabledWindowUnderIt) {
  EXPECT_THAT(LogOfTap(kView), ElementsAre("tap 50 124"));
  platform::CFrameWindow& frame = *Program().MainFrame();
  platform::CWindow child(&frame.View(), {40, 110, 60, 140});
  EXPECT_THAT(LogOfTap(kView), IsEmpty());  // the child takes it
  EXPECT_EQ(&frame.View().WindowAt(kViewTap), &child);
  child.EnableWindow(false);
  EXPECT_THAT(LogOfTap(kView), ElementsAre("tap 50 124"));
  child.EnableWindow(true);
  child.ShowWindow(false);
  EXPECT_THAT(LogOfTap(kView), ElementsAre("tap 50 124"));
  frame.View().EnableWindow(false);
  EXPECT_THAT(LogOfTap(kView), ElementsAre("tap on the frame"));
}

TEST_F(FrameTest, FramesAreShownOnlyWhenSomethingChanged) {
  int frames = 0;
  m_desk.Host().SetFrameHandler([&](const platform::CBitmap&) { ++frames; });
  LogOfTap(kView);
  LogOfKeys({"K", "Q"});
  EXPECT_EQ(frames, 0);
  Program().MainFrame()->View().Invalidate();
  Program().MainFrame()->Invalidate();
  m_desk.RunUntilIdle();
  EXPECT_EQ(frames, 1);
}

TEST_F(FrameTest, ToolButtonsWorkWhenReleasedOnThem) {
  using enum InputKind;
  const Point button = ToolButton(0);
  EXPECT_THAT(LogOfTap(button), ElementsAre("run 101"));
  EXPECT_THAT(LogOf({{kPointerDown, button}, {kPointerMove, kView}, {kPointerUp, kView}}),
              IsEmpty());
  EXPECT_THAT(LogOf({{kPointerDown, button}, {kPointerUp, ToolButton(1)}}), IsEmpty());
  EXPECT_THAT(LogOf({{kPointerDown, button},
                     {kPointerMove, kView},
                     {kPointerMove, button},
                     {kPointerUp, button}}),
              ElementsAre("run 101"));
  EXPECT_THAT(LogOf({{kPointerDown, kView}, {kPointerUp, button}}), ElementsAre("tap 50 124"));
}

TEST_F(FrameTest, ToolButtonsShowWhetherTheyMayBePressed) {
  const platform::CBitmap before = m_desk.Host().Shown();
  EXPECT_THAT(LogOfTap(ToolButton(1)), ElementsAre("run 102"));
  EXPECT_NE(m_desk.Host().Shown(), before);
  EXPECT_THAT(LogOfTap(ToolButton(0)), IsEmpty());
  Program().Disabled().clear();
  m_desk.RunUntilIdle();
  EXPECT_EQ(m_desk.Host().Shown(), before);
}

TEST_F(FrameTest, TheCloseButtonClosesWhenReleasedOnIt) {
  LogOf({{InputKind::kPointerDown, kCloseButton}, {InputKind::kPointerUp, kView}});
  EXPECT_TRUE(m_desk.RunUntilIdle());
  LogOfTap(kCloseButton);
  EXPECT_FALSE(m_desk.RunUntilIdle());
}

TEST_F(FrameTest, TheMenuIsWorkedByPointer) {
  using enum InputKind;
  EXPECT_THAT(LogOfTap(kMenuTitle), IsEmpty());
  EXPECT_TRUE(IsMenuOpen());
  EXPECT_THAT(LogOfTap(MenuLine(0)), ElementsAre("run 101"));
  EXPECT_FALSE(IsMenuOpen());
  // Pressed on the title, drawn to a line, released there.
  EXPECT_THAT(LogOf({{kPointerDown, kMenuTitle},
                     {kPointerMove, MenuLine(1)},
                     {kPointerMove, MenuLine(3)},
                     {kPointerUp, MenuLine(3)}}),
              ElementsAre("frame runs 103"));
  EXPECT_FALSE(IsMenuOpen());
  // Released beside it, it stays; the next press beside it only closes it.
  EXPECT_THAT(LogOf({{kPointerDown, kMenuTitle}, {kPointerUp, kView}}), IsEmpty());
  EXPECT_TRUE(IsMenuOpen());
  EXPECT_THAT(LogOfTap({200, 250}), IsEmpty());
  EXPECT_FALSE(IsMenuOpen());
  EXPECT_THAT(LogOfTap({200, 250}), ElementsAre("tap 200 224"));
  // A separator is nothing to choose.
  LogOfTap(kMenuTitle);
  EXPECT_THAT(LogOfTap({20, 70}), IsEmpty());
  EXPECT_TRUE(IsMenuOpen());
  LogOfTap(kMenuTitle);
  EXPECT_FALSE(IsMenuOpen());
}

TEST_F(FrameTest, TheMenuIsWorkedByKeys) {
  struct Case {
    std::vector<std::string> keys;
    std::vector<std::string> log;
    bool open = false;
  };
  for (const Case& c : std::vector<Case>{
           {{"F10", "Enter"}, {"run 101"}},
           {{"Alt+F", "Enter"}, {"run 101"}},
           {{"Alt+F", "Down", "Down", "Enter"}, {"frame runs 103"}},
           {{"F10", "Down", "Down", "Down", "Down", "Enter"}, {"run 101"}},
           {{"F10", "Up", "Up", "Enter"}, {"frame runs 103"}},
           {{"F10", "T"}, {"run 102"}},
           {{"F10", "F"}, {"frame runs 103"}},  // by its first letter, as it has no mnemonic
           {{"F10", "X"}, {"program runs 57665"}},
           {{"F10", "Escape"}, {}},
           {{"F10", "F10"}, {}},
           {{"F10", "Q"}, {}, true},
           {{"F10", "K"}, {}, true},  // not for the view
           {{"F"}, {}},
           {{"Alt+G"}, {}}}) {
    Program().Disabled().clear();
    EXPECT_EQ(LogOfKeys(c.keys), c.log) << testing::PrintToString(c.keys);
    EXPECT_EQ(IsMenuOpen(), c.open) << testing::PrintToString(c.keys);
    if (IsMenuOpen()) LogOfKeys({"Escape"});
  }
}

TEST_F(FrameTest, TheMenuGreysWhatMayNotRun) {
  Program().Disabled() = {kViewCommand};
  for (const std::vector<std::string>& keys :
       {std::vector<std::string>{"F10", "Enter"}, {"F10", "O"}}) {
    EXPECT_THAT(LogOfKeys(keys), IsEmpty());
    EXPECT_TRUE(IsMenuOpen());
    EXPECT_THAT(LogOfTap(MenuLine(0)), IsEmpty());
    LogOfKeys({"Escape"});
  }
  Program().Disabled().clear();
  LogOfKeys({"F10"});
  Program().Disabled() = {kViewCommand};  // since the menu opened
  EXPECT_THAT(LogOfKeys({"Enter"}), IsEmpty());
  EXPECT_FALSE(IsMenuOpen());
}

TEST(KeyStrokes, AreNamedByChords) {
  using platform::Key;
  using platform::KeyStroke;
  struct Case {
    const char* chord = nullptr;
    KeyStroke stroke;
  };
  for (const Case& c : {Case{"Enter", {Key::kEnter, 0, false, false, false}},
                        Case{"Shift+Tab", {Key::kTab, 0, false, false, true}},
                        Case{"h", {Key::kCharacter, 'H', false, false, false}},
                        Case{"Ctrl+N", {Key::kCharacter, 'N', true, false, false}},
                        Case{"Ctrl+Alt+Shift+F4", {Key::kF4, 0, true, true, true}},
                        Case{"Space", {Key::kCharacter, ' ', false, false, false}},
                        Case{"+", {Key::kCharacter, '+', false, false, false}},
                        Case{"Ctrl++", {Key::kCharacter, '+', true, false, false}}}) {
    EXPECT_EQ(platform::ParseChord(c.chord), c.stroke) << c.chord;
  }
  for (const char* chord : {"", "Ctrl+", "Hyper+A", "enter", "AB", "\x7F", "\xC3\xA4"}) {
    EXPECT_FALSE(platform::ParseChord(chord).has_value()) << chord;
  }
}

}  // namespace
}  // namespace feltside::tests
