#pragma once

#include <array>
#include <initializer_list>
#include <memory>
#include <string>
#include <vector>

#include "engine/blackjack_hand.h"
#include "engine/shoe.h"
#include "platform/window/frame_window.h"
#include "platform/window/view.h"
#include "render/table_layout.h"

namespace platform {
class CProfileSection;
}

namespace feltside {

enum Setting : int;

inline constexpr int kGameBlackjack = 0;
inline constexpr int kGameVideoPoker = 1;

inline constexpr int kStrategyNone = 0;
inline constexpr int kStrategyButton = 1;  ///< advice on request, each move judged by a lamp
inline constexpr int kStrategyAlways = 2;

inline constexpr int kPokerCards = 5;

/// The table: the whole state of both games and every operation on it. It is the program's one
/// view, and only the framework calls it, by the names that it knows: all but the constructor is
/// private.
///
/// This is a map: a block for each file in which members are defined, in the order in which one
/// reads the game. Flags are ints of 0 or 1. An operation works on the members and ends with a
/// repaint, one for all that it did; which may run when is for the commands, taps and keys to say.
/// Money moves only when a blackjack deal is settled, when the insurance question is answered and,
/// in video poker, at the deal and the draw.
class CFeltsideView : public platform::CView {
 public:
  explicit CFeltsideView(platform::CFrameWindow& frame);

 private:
  friend class CTableState;  ///< shows the state to whoever tries the table out

  // Right here: which hand is meant.
  CBlackjackHand& ActiveHand() { return m_bPlayingSplit != 0 ? m_handSplit : m_handPlayer; }
  const CBlackjackHand& ActiveHand() const {
    return m_bPlayingSplit != 0 ? m_handSplit : m_handPlayer;
  }
  std::string& ActiveScore() { return m_bPlayingSplit != 0 ? m_strSplitScore : m_strPlayerScore; }
  std::string& ActiveMsg() { return m_bPlayingSplit != 0 ? m_strSplitMsg : m_strPlayerMsg; }
  bool IsSplit() const { return m_handSplit.GetCount() > 0; }
  int UpCard() const { return m_handDealer.GetCard(1); }

  // table/feltside_view.cpp: what both games share.

  /// Reads the settings, then shuffles all shoes. Comes again when the document is renewed: a hand
  /// that is being played goes on, and its cards are not in the shuffled shoe.
  void OnInitialUpdate() override;
  /// Deals the selected game. From the first deal on there is no title.
  void OnDeal();
  /// Paints the whole table and shows it before it returns.
  void Repaint();

  // table/shoes.cpp: where the cards come from.

  /// The shoe that blackjack deals from; null for a deck choice outside 0..2, which no setting
  /// makes.
  CShoe* SelectedShoe();
  /// Before a deal of blackjack: shuffles its shoe, unless that is so near its end that the deal
  /// goes on with what is left.
  void PrepareShoe();
  /// The next card of blackjack; kNoCard without a shoe.
  int NextCard();
  /// A shoe's next card. When it has run out in the middle of a deal, it is shuffled anew without
  /// the cards that are out already.
  static int DrawFrom(CShoe& shoe, std::initializer_list<const CCardHand*> out);
  /// Takes the cards on the table out of the shoe that was just shuffled.
  void TakeOutHands();

  // table/blackjack_play.cpp: the deal, the insurance question, the moves and the stake.

  /// A natural ends the deal at once, the player's before the dealer's; but when the dealer shows
  /// an ace, the insurance question comes first.
  void DealBlackjack();
  /// Takes the player's answer, 1 for yes, and resolves the question.
  void AnswerInsurance(int taken);
  /// Insurance always costs half the stake; against a dealer's natural that is all the deal costs.
  /// Such a deal is over here, without a settlement.
  void ResolveInsurance();
  /// At 21 or more the hand's turn is over; nothing for a hand that is bust.
  void Hit();
  void Stand();
  void PlaySplitHand();
  /// One card, and the hand's turn is over.
  void DoubleDown();
  void Split();
  // Neither repaints: a tap may do both.
  void RaiseBet();
  void LowerBet();

  // table/dealer_play.cpp: the dealer's turn and the settlement.

  /// The dealer draws, with a pause between cards, and the deal is settled before this returns.
  /// Meanwhile the frame is disabled; keys that come are dropped, taps wait until it is over.
  void DealerPlay();
  /// Clears away the commands that were already waiting when the dealer began: the disabled frame
  /// refuses them. Everything else is kept back, as in the pauses, until the deal is settled.
  void PumpMessages();
  /// Ends the deal and moves its money, with the dealer's hand as it stands.
  void Settle();
  /// The message that a hand's end is told with; moves its stake.
  std::string SettleHand(const CBlackjackHand& hand, int stake);

  // table/video_poker_play.cpp: the deal, the marks and the draw.

  /// Takes the dollar of the deal whatever the wallet holds.
  void DealVideoPoker();
  /// Marks a card, 0..4, for the draw or unmarks it; nothing beyond m_nMaxDiscards marks.
  void ToggleDiscard(int slot);
  /// Replaces the marked cards, names the hand and pays it.
  void DrawVideoPoker();

  // table/play_commands.cpp: the commands, which may run when, and the adviser's verdict.

  struct Commands;
  platform::CommandState QueryCommand(int commandID) const override;
  void RunCommand(int commandID) override;
  bool CanDeal() const;
  bool CanStand() const;
  /// Not with a full hand, which could only lose the card.
  bool CanHit() const;
  bool CanDoubleDown() const;
  bool CanSplit() const;
  void OnHit();
  void OnStand();
  void OnDoubleDown();
  void OnSplit();
  /// With advice on request: has the lamp say whether a move, which is still to be made, is the
  /// adviser's.
  void JudgeMove(int adviceCode);

  // table/taps.cpp: taps on the table.

  void OnLButtonDown(platform::Point p) override;
  void TapBlackjack(platform::Point p);
  /// Between deals too, when the button is not drawn; but not before the first frame of the table.
  bool IsStrategyButtonLive() const;
  void TapInsurance(platform::Point p);
  /// The two buttons overlap by a few columns; a tap there lowers and then raises.
  void TapStake(platform::Point p);
  void TapVideoPoker(platform::Point p);
  bool IsOnDealButton(platform::Point p) const;

  // table/keys.cpp: the table by keyboard. Each returns whether the key meant something.

  bool OnKeyDown(const platform::KeyStroke& stroke) override;
  bool KeyDeal();
  bool KeyMark(char key);
  bool KeyTableButton(char key);

  // table/tips.cpp: what the buttons on the table are called.

  platform::ToolTip TipAt(platform::Point p) const override;
  // Of the buttons that the table shows, also of those that are grey.
  std::vector<platform::ToolTip> BlackjackTips() const;
  std::vector<platform::ToolTip> VideoPokerTips() const;

  // table/words.cpp: the table in words, for whoever plays by ear.

  platform::Phrases Words() const override;
  platform::Phrases BlackjackWords() const;
  void AddPlayerHands(platform::Phrases& words) const;
  /// What the lamp says of the last move.
  std::string VerdictWords() const;
  /// What is to be known for the next step, and which keys take it.
  std::string BlackjackChoices() const;
  std::string Moves() const;
  platform::Phrases VideoPokerWords() const;
  /// Which cards are held.
  std::string MarkWords() const;

  // render/frame.cpp: how a frame is put together.

  /// Returns true: the paint covers every pixel itself, so nothing is cleared before it.
  bool OnEraseBkgnd(platform::CSurface& surface) override;
  void OnDraw(platform::CSurface& surface) override;
  void DrawTitle(platform::CSurface& surface);
  void DrawTable(platform::CSurface& surface);
  // Each picture is loaded at its first use and kept: the title's until the first deal, the
  // poker table's until it is switched off.
  void LoadTitleBitmap();
  void LoadTableBitmap();
  void LoadPokerBitmap();

  // render/blackjack_frame.cpp: one blackjack frame. The layout must be prepared.

  void DrawBlackjackTable();
  void DrawPlayerSide();
  void DrawDealerSide();
  void DrawStrategy();
  /// Whether there is advice in a hand; where not, the button for it, or nothing.
  bool IsAdviceShown() const;
  std::string AdviceText() const;

  // render/video_poker_frame.cpp: one video-poker frame, on the surface that the layout has.

  /// Nothing for another game type.
  void DrawVideoPokerTable(platform::CSurface& surface);
  void DrawFancyPokerTexts(platform::CSurface& surface);

  // shell/settings.cpp: the player's choices, from the profile and back.

  struct Settings;
  /// While a hand is played its game stays selected, whatever the profile says.
  void LoadSettings();
  /// Catches up on settings that could not be read in their time: none is to be lost to a default
  /// that stood in for it. What was chosen since stands.
  void LoadUnreadSettings(const platform::CProfileSection& stored);
  /// Stores these in one step, in this order.
  void StoreSettings(std::initializer_list<Setting> settings);
  /// Sets the dealer's pause by a speed, 0 slow to 2 fast; any other leaves it as it was.
  void SetPlaySpeed(int speed);
  /// The speed that the pause stands for; -1 for none.
  int PlaySpeed() const;

  // shell/setup_commands.cpp: the setup dialogs, and keeping what was chosen there.

  void OnGameSetup();
  void OnTableSetup();

  // shell/high_score_commands.cpp: the high scores, and leaving the table.

  bool CanShowHighScores() const;
  void OnHighScores();
  /// Asks for a name first when the result earns a place.
  void OnExit();

  // The state.

  int m_nGameType = kGameBlackjack;
  CBlackjackHand m_handPlayer;
  CBlackjackHand m_handSplit;   ///< holds cards only after a split
  CBlackjackHand m_handDealer;  ///< card 0 is the hole card, card 1 the up card
  std::string m_strPlayerMsg;   ///< the main hand's result; in video poker the category
  std::string m_strSplitMsg;
  std::string m_strDealerScore;  ///< a total or "Blackjack!"; empty while the player acts
  std::string m_strPlayerScore;
  std::string m_strSplitScore;
  CSingleDeck m_deck1;  ///< video poker deals from it too
  CFourDeckShoe m_shoe4;
  CSixDeckShoe m_shoe6;
  int m_nDeckChoice = 1;  ///< 0: one deck, 1: four, 2: six
  CTableLayout m_layout;
  int m_bShowTitle = 1;  ///< until the first deal
  std::unique_ptr<platform::CBitmap> m_pTitleBitmap;
  std::unique_ptr<platform::CBitmap> m_pTableBitmap;
  int m_nStrategyMode = kStrategyButton;
  int m_bShowAdvice = 0;  ///< the strategy button was tapped in this deal
  int m_bDoubledPlayer = 0;
  int m_bDoubledSplit = 0;
  double m_dWallet = 100.0;   ///< dollars; may fall below zero
  int m_nBet = 5;             ///< dollars; a multiple of 5, at least 5
  int m_nDealerDelay = 1000;  ///< milliseconds between the dealer's cards: 2000, 1000 or 200
  int m_bHandInProgress = 0;  ///< until the dealer's play begins; in video poker until the draw
  int m_bSettingsUnread = 0;  ///< the defaults stand in for what could not be read
  int m_bUseHighScores = 1;
  int m_bPlayingSplit = 0;
  int m_bFancyBlackjack = 1;
  int m_bInsuranceTaken = 0;
  int m_bInsuranceOffered = 0;  ///< the question waits for its answer
  int m_bShowVerdict = 0;       ///< the lamp is lit, until the next deal
  int m_bVerdictCorrect = 0;    ///< of the last move; kept when the lamp goes out
  std::unique_ptr<platform::CBitmap> m_pPokerBitmap;
  int m_nMaxDiscards = 3;  ///< 0..5; the dialog knows 3 and 5
  int m_bFancyPoker = 1;
  int m_bDrawPending = 0;  ///< five cards are dealt and can be marked
  CCardHand m_handPoker;
  std::array<int, kPokerCards> m_bDiscard{};  ///< the marks; none between deals
};

/// Money in whole dollars, cut toward zero; beyond an int's range, the nearest bound.
int WholeDollars(double dollars);

}  // namespace feltside
