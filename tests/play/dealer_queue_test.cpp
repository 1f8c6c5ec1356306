// What waits or comes while the dealer plays never touches the deal that is being settled.

#include <gmock/gmock.h>

#include "platform/frame_window.h"
#include "shell/feltside_app.h"
#include "shell/table_state.h"
#include "table/command_ids.h"
#include "tests/support/desk.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

using platform::InputKind;
using platform::Message;
using platform::MessageKind;

Message Command(int commandID) { return {MessageKind::kCommand, {}, commandID, 0}; }

/// At a place of the table.
Message Press(int x, int y) {
  Message message;
  message.input.kind = InputKind::kPointerDown;
  message.input.at = {x, y + platform::CFrameWindow::kBarHeight};
  return message;
}

Message KeyStroke(const char* chord) {
  Message message;
  message.input.kind = InputKind::kKey;
  message.input.stroke = platform::ParseChord(chord).value();
  return message;
}

/// A deal of 18 against ten and two, about to be stood on; the dealer draws a four and a five to
/// 21, with a pause between the two.
class DealersTurn : public testing::Test {
 protected:
  DealersTurn() {
    Table().Stack({10, 8, 23, 15, 4, 5});
    m_desk.Program().Queue().PostCommand(kCommandDeal);
    m_desk.RunUntilIdle();
  }

  CTableState Table() {
    return CTableState(static_cast<CFeltsideView&>(m_desk.Program().MainFrame()->View()));
  }
  /// Lets the dealer play with these messages waiting behind the Stand that starts it.
  bool StandBefore(const std::vector<Message>& waiting) {
    m_desk.Program().Queue().PostCommand(kCommandStand);
    for (const Message& message : waiting) m_desk.Program().Queue().Post(message);
    return m_desk.RunUntilIdle();
  }
  std::string WrongWith(const Json& expected) { return Missing(Json(Table().Read()), expected); }

  Desk<CFeltsideApp> m_desk;
  const Json m_settled = {{"m_dWallet", 95.0},
                          {"m_nBet", 5},
                          {"m_bHandInProgress", 0},
                          {"m_strPlayerMsg", "Dealer Wins!"},
                          {"m_strDealerScore", "21"},
                          {"m_handPlayer", {10, 8}},
                          {"m_handSplit", Json::array()},
                          {"m_handDealer", {23, 15, 4, 5}},
                          {"m_bShowAdvice", 0},
                          {"m_bDoubledPlayer", 0},
                          {"m_shoe4", {{"position", 208}, {"shuffles", 2}}}};
};

TEST_F(DealersTurn, SettlesOnceWhateverWaits) {
  const std::vector<Message> waiting = {Command(kCommandHit),
                                        Command(kCommandStand),
                                        Command(kCommandDoubleDown),
                                        Command(kCommandSplit),
                                        Command(kCommandDeal),
                                        Press(110, 160),
                                        Press(90, 160),
                                        Press(180, 118),
                                        Command(kCommandGameSetup),
                                        Command(kCommandTableSetup),
                                        Command(platform::kCommandNew),
                                        KeyStroke("H"),
                                        KeyStroke("Enter"),
                                        KeyStroke("+"),
                                        KeyStroke("F10"),
                                        KeyStroke("Ctrl+N")};
  EXPECT_TRUE(StandBefore(waiting));
  EXPECT_EQ(WrongWith(m_settled), "");
  EXPECT_EQ(m_desk.Program().Screen().Windows().size(), 1U);
  EXPECT_TRUE(m_desk.Program().MainFrame()->IsCommandEnabled(kCommandDeal));
}

TEST_F(DealersTurn, IsOverBeforeTheProgramIsLeft) {
  EXPECT_FALSE(
      StandBefore({Command(platform::kCommandExit), Command(kCommandDeal), Press(110, 160)}));
  EXPECT_EQ(WrongWith(m_settled), "");
}

TEST_F(DealersTurn, IsOverBeforeTheWindowIsClosed) {
  EXPECT_FALSE(StandBefore({{MessageKind::kClose, {}, 0, 0}, Command(kCommandHit)}));
  EXPECT_EQ(WrongWith(m_settled), "");
}

TEST_F(DealersTurn, HandlesWhatComesInItsPausesAfterwards) {
  int pauses = 0;
  m_desk.Host().SetPauseHandler([&] {
    ++pauses;
    EXPECT_EQ(WrongWith({{"m_dWallet", 100.0}, {"m_handDealer", {23, 15, 4}}}), "");
    m_desk.Host().PutPointer(InputKind::kPointerDown, {110, 186});  // raises the stake
    m_desk.Host().PutPointer(InputKind::kPointerUp, {110, 186});
    m_desk.Host().PutKey("H");
  });
  EXPECT_TRUE(StandBefore({}));
  Json expected = m_settled;
  expected["m_nBet"] = 10;
  EXPECT_EQ(WrongWith(expected), "");
  EXPECT_EQ(pauses, 1);
}

TEST_F(DealersTurn, ClosesAfterwardsWhenAskedInAPause) {
  m_desk.Host().SetPauseHandler([&] { m_desk.Host().PutPointer(InputKind::kClose, {}); });
  EXPECT_FALSE(StandBefore({}));
  EXPECT_EQ(WrongWith(m_settled), "");
}

TEST_F(DealersTurn, ShowsEveryCardInAWholeFrame) {
  std::vector<std::size_t> dealerCards;
  m_desk.Host().SetFrameHandler([&](const platform::CBitmap&) {
    dealerCards.push_back(Table().Read()["m_handDealer"].size());
  });
  StandBefore({});
  EXPECT_THAT(dealerCards, testing::Contains(3U));
  EXPECT_EQ(dealerCards.back(), 4U);
}

TEST(DealersPause, IsAsLongAsThePlaySpeedSays) {
  for (const auto& [speed, milliseconds] : {std::pair{0, 2000}, {1, 1000}, {2, 200}}) {
    Desk<CFeltsideApp> desk("[Settings]\nPLAYSPEED = " + std::to_string(speed));
    auto& view = static_cast<CFeltsideView&>(desk.Program().MainFrame()->View());
    CTableState(view).Stack({10, 8, 2, 3, 2, 3, 2});  // three cards, a pause after each
    desk.Program().Queue().PostCommand(kCommandDeal);
    desk.Program().Queue().PostCommand(kCommandStand);
    desk.RunUntilIdle();
    EXPECT_EQ(desk.Host().Ticks(), 3 * milliseconds);
  }
}

}  // namespace
}  // namespace feltside::tests
