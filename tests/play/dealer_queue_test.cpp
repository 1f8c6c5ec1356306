// What waits or comes while the dealer plays never touches the deal that is being settled.

#include <gmock/gmock.h>

#include "platform/window/frame_window.h"
#include "table/command_ids.h"
#include "tests/support/desk.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

using platform::InputKind;
using platform::Message;
using platform::MessageKind;

Message Command(int commandID) { return {MessageKind::kCommand, {}, commandID, 0}; }

constexpr platform::Point kRaise{110, 186};
constexpr platform::Point kHitButton{75, 12};
constexpr platform::Point kMenuTitle{30, 12};

Message Press(platform::Point at) {
  Message message;
  message.input.kind = InputKind::kPointerDown;
  message.input.at = at;
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
    m_desk.Table().Stack({10, 8, 23, 15, 4, 5});
    m_desk.Command(kCommandDeal);
    m_desk.Host().SetFrameHandler([this] { m_arrStates.push_back(m_desk.State()); });
  }

  /// Lets the dealer play with these messages waiting behind the Stand that starts it.
  bool StandBefore(const std::vector<Message>& waiting) {
    Desk::Post(Command(kCommandStand));
    for (const Message& message : waiting) Desk::Post(message);
    return m_desk.Run();
  }
  bool WasShown(const Json& expected) const {
    return std::any_of(m_arrStates.begin(), m_arrStates.end(),
                       [&](const Json& state) { return Missing(state, expected).empty(); });
  }
  void ExpectShown(const Json& expected) { EXPECT_EQ(Missing(m_arrStates.back(), expected), ""); }

  Desk m_desk;
  std::vector<Json> m_arrStates;  ///< one for each frame that was shown
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
  EXPECT_TRUE(StandBefore(
      {Command(kCommandHit), Command(kCommandStand), Command(kCommandDoubleDown),
       Command(kCommandSplit), Command(kCommandDeal), Press(kHitButton), Press(kMenuTitle),
       Command(kCommandGameSetup), Command(kCommandTableSetup), Command(platform::kCommandNew),
       KeyStroke("H"), KeyStroke("Enter"), KeyStroke("+"), KeyStroke("F10"), KeyStroke("Ctrl+N")}));
  ExpectShown(m_settled);
  EXPECT_EQ(Missing(m_desk.State(), m_settled), "");
  EXPECT_EQ(platform::TheApp().Screen().Windows().size(), 1U);
  EXPECT_TRUE(platform::TheApp().MainFrame()->IsCommandEnabled(kCommandDeal));
}

TEST_F(DealersTurn, IsOverBeforeTheProgramIsLeft) {
  EXPECT_FALSE(
      StandBefore({Command(platform::kCommandExit), Command(kCommandDeal), Press(kRaise)}));
  EXPECT_TRUE(WasShown(m_settled));
}

TEST_F(DealersTurn, IsOverBeforeTheWindowIsClosed) {
  EXPECT_FALSE(StandBefore({{MessageKind::kClose, {}, 0, 0}, Command(kCommandHit)}));
  ExpectShown(m_settled);
}

TEST_F(DealersTurn, HandlesWhatComesInItsPausesAfterwards) {
  m_desk.Host().SetPauseHandler([&] {
    ExpectShown({{"m_dWallet", 100.0},
                 {"m_handDealer", {23, 15, 4}},
                 {"m_bHandInProgress", 0},
                 {"m_strDealerScore", "16"}});
    for (const platform::Point at : {kRaise, kHitButton, kMenuTitle}) {
      m_desk.Host().PutPointer(InputKind::kPointerDown, at);
    }
    // Keys struck in impatience do nothing: the result is to be read first.
    for (const char* key : {"H", "Enter", "+"}) m_desk.Host().PutKey(key);
  });
  EXPECT_TRUE(StandBefore({}));
  EXPECT_TRUE(WasShown(m_settled));
  ExpectShown({{"m_nBet", 10}, {"m_dWallet", 95.0}, {"m_handPlayer", {10, 8}}});
  EXPECT_EQ(platform::TheApp().Screen().Windows().size(), 1U);
}

TEST_F(DealersTurn, HandlesATapThatWaitedForItAfterwards) {
  EXPECT_TRUE(StandBefore({Press(kRaise)}));
  EXPECT_TRUE(WasShown(m_settled));
  ExpectShown({{"m_nBet", 10}, {"m_dWallet", 95.0}});
}

TEST_F(DealersTurn, ClosesAfterwardsWhenAskedInAPause) {
  m_desk.Host().SetPauseHandler([&] { m_desk.Host().PutPointer(InputKind::kClose, {}); });
  EXPECT_FALSE(StandBefore({}));
  ExpectShown(m_settled);
}

TEST(DoubleDown, IsShownBeforeTheDealerDraws) {
  Desk desk;
  desk.Table().Stack({6, 5, 23, 15, 9, 4, 5});
  desk.Command(kCommandDeal);
  std::vector<Json> states;
  desk.Host().SetFrameHandler([&] { states.push_back(desk.State()); });
  desk.Command(kCommandDoubleDown);
  EXPECT_EQ(Missing(states.at(0), {{"m_handPlayer", {6, 5, 9}}, {"m_bHandInProgress", 1}}), "");
}

TEST(DealersPause, IsAsLongAsThePlaySpeedSays) {
  for (const auto& [speed, milliseconds] : {std::pair{0, 2000}, {1, 1000}, {2, 200}}) {
    Desk desk("[Settings]\nPLAYSPEED = " + std::to_string(speed));
    desk.Table().Stack({10, 8, 2, 3, 2, 3, 2});  // three cards, a pause after each
    desk.Command(kCommandDeal);
    desk.Command(kCommandStand);
    EXPECT_EQ(desk.Host().Ticks(), 3 * milliseconds);
  }
}

}  // namespace
}  // namespace feltside::tests
