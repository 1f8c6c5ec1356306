#pragma once

#include <array>
#include <initializer_list>
#include <memory>
#include <string>

#include "engine/blackjack_hand.h"
#include "engine/shoe.h"
#include "platform/window/frame_window.h"
#include "platform/window/view.h"
#include "render/table_layout.h"

namespace feltside {

inline constexpr int kGameBlackjack = 0;
inline constexpr int kGameVideoPoker = 1;

inline constexpr int kStrategyNone = 0;
inline constexpr int kStrategyButton = 1;  ///< advice on request, each move judged by a lamp
inline constexpr int kStrategyAlways = 2;

inline constexpr int kPokerCards = 5;

/// The table: the whole state of both games and every operation on it. It is the program's one
/// view.
///
/// Flags are ints of 0 or 1. An operation works on the members and ends with a repaint; which may
/// run when is for the command states and the taps to say. Money moves only when a deal is settled,
/// when the insurance question is answered and, in video poker, at the deal and the draw.
class CFeltsideView : public platform::CView {
 public:
  explicit CFeltsideView(platform::CFrameWindow& frame);

  // The framework's notifications.
  void OnInitialUpdate() override;
  void OnDraw(platform::CSurface& surface) override;
  bool OnEraseBkgnd(platform::CSurface& surface) override;
  void OnLButtonDown(platform::Point p) override;
  bool OnKeyDown(const platform::KeyStroke& stroke) override;
  platform::CommandState QueryCommand(int commandID) const override;
  void RunCommand(int commandID) override;

 private:
  friend class CTableState;  ///< shows the state to whoever tries the table out
  struct Commands;

  // Commands.
  void OnHit();
  void OnStand();
  void OnDoubleDown();
  void OnSplit();
  void OnDeal();
  void OnGameSetup();
  void OnTableSetup();
  void OnHighScores();
  void OnExit();
  bool CanDeal() const;
  bool CanHit() const;
  bool CanStand() const;
  bool CanDoubleDown() const;
  bool CanSplit() const;
  bool CanShowHighScores() const;
  void JudgeMove(int adviceCode);

  // Blackjack.
  void DealBlackjack();
  void Hit();
  void Stand();
  void DoubleDown();
  void Split();
  void ResolveInsurance();
  void AnswerInsurance(int taken);
  void DealerPlay();
  void PumpMessages();
  void Settle();
  /// The message that a hand's end is told with; moves its stake.
  std::string SettleHand(const CBlackjackHand& hand, int stake);
  void RaiseBet();
  void LowerBet();
  void PlaySplitHand();
  int NextCard();
  /// A shoe's next card. When it has run out in the middle of a deal, it is shuffled anew without
  /// the cards that are out already.
  static int DrawFrom(CShoe& shoe, std::initializer_list<const CCardHand*> out);
  void SetHandsAside();
  void PrepareShoe();
  /// The shoe that blackjack deals from; null for a deck choice outside 0..2.
  CShoe* SelectedShoe();
  CBlackjackHand& ActiveHand() { return m_bPlayingSplit != 0 ? m_handSplit : m_handPlayer; }
  const CBlackjackHand& ActiveHand() const {
    return m_bPlayingSplit != 0 ? m_handSplit : m_handPlayer;
  }
  // Of the active hand.
  std::string& ActiveScore() { return m_bPlayingSplit != 0 ? m_strSplitScore : m_strPlayerScore; }
  std::string& ActiveMsg() { return m_bPlayingSplit != 0 ? m_strSplitMsg : m_strPlayerMsg; }
  bool IsSplit() const { return m_handSplit.GetCount() > 0; }
  int UpCard() const { return m_handDealer.GetCard(1); }

  // Video poker.
  void DealVideoPoker();
  void ToggleDiscard(int slot);
  void DrawVideoPoker();

  // Taps.
  void TapBlackjack(platform::Point p);
  void TapVideoPoker(platform::Point p);
  void TapInsurance(platform::Point p);
  void TapStake(platform::Point p);
  bool IsOnDealButton(platform::Point p) const;
  bool IsStrategyButtonLive() const;

  // Keys; each answers whether the key meant something.
  bool KeyDeal();
  bool KeyMark(char key);
  bool KeyTableButton(char key);

  // Settings.
  struct Settings;
  void LoadSettings();
  /// Stores these in one step, in this order.
  void StoreSettings(std::initializer_list<const char*> names);
  int PlaySpeed() const;
  void SetPlaySpeed(int speed);

  // Drawing.
  void DrawTitle(platform::CSurface& surface);
  void DrawTable(platform::CSurface& surface);
  void DrawBlackjackTable();
  void DrawPlayerSide();
  void DrawDealerSide();
  void DrawStrategy();
  std::string AdviceText() const;
  void DrawVideoPokerTable(platform::CSurface& surface);
  void DrawFancyPokerTexts(platform::CSurface& surface);
  void LoadTitleBitmap();
  void LoadTableBitmap();
  void LoadPokerBitmap();
  void Repaint();

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
  int m_bHandInProgress = 0;
  int m_bUseHighScores = 1;
  int m_bPlayingSplit = 0;
  int m_bFancyBlackjack = 1;
  int m_bInsuranceTaken = 0;
  int m_bInsuranceOffered = 0;  ///< the question waits for its answer
  int m_bShowVerdict = 0;
  int m_bVerdictCorrect = 0;
  std::unique_ptr<platform::CBitmap> m_pPokerBitmap;
  int m_nMaxDiscards = 3;
  int m_bFancyPoker = 1;
  int m_bDrawPending = 0;
  CCardHand m_handPoker;
  std::array<int, kPokerCards> m_bDiscard{};
};

/// Money in whole dollars, cut toward zero; beyond an int's range, the nearest bound.
int WholeDollars(double dollars);

}  // namespace feltside
