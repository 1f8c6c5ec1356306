#pragma once

#include <vector>

#include "engine/card_hand.h"
#include "platform/host/runtime.h"

namespace feltside {

/// The seed of a shoe's shuffle number nShuffles: that number times day, month, minute, second and
/// hour. A factor of 0 is left out, lest every shuffle at midnight be the same. Wraps.
unsigned ShuffleSeed(unsigned nShuffles, const platform::LocalTime& time);

/// One or more decks in one pile, dealt from the front. Games use one of the three sizes below. It
/// never shuffles by itself: whoever deals decides when.
class CShoe {
 public:
  /// Puts all cards in order, deck after deck, and starts dealing from the front.
  void Fill();

  /// Fills, then shuffles with a seed from the clock and the number of shuffles so far, so that two
  /// shuffles within one second differ. Reads the clock of the host, and seeds the one generator of
  /// the process.
  void Shuffle();

  /// Deals the next card. An exhausted shoe returns kNoCard and stays exhausted; so does one that
  /// was never filled, for every card.
  int TakeCard();

  /// After a shuffle in the midst of a deal: takes the cards of a hand, which lie on the table, out
  /// of those still to come, as if they had just been dealt. A card that the shoe has no more of is
  /// passed over.
  void TakeOut(const CCardHand& hand);

  /// Whether so few cards are left that a deal goes on with them rather than with a fresh shuffle.
  bool IsNearEnd() const { return m_nCount - m_nNext <= kReserve; }

  /// For trying out hands: puts these cards into the last slots and deals them next. The shoe then
  /// stands at its end, so that a deal of at most so many cards does not shuffle it anew. More
  /// cards than the shoe has slots change nothing.
  void StackTop(const std::vector<int>& cards);

  int GetPosition() const { return m_nNext; }  ///< slot of the next card; the count when exhausted
  int GetCount() const { return m_nCount; }    ///< cards in the full shoe
  unsigned GetShuffles() const { return m_nShuffles; }  ///< 1 plus the shuffles so far

 protected:
  explicit CShoe(int decks);

 private:
  static constexpr int kReserve = 15;  // cards

  /// A message box for each slot that holds no card. After a fill there is none; a faulty one would
  /// otherwise show only in play.
  void CheckCards() const;

  std::vector<int> m_nCard;  // m_nCount slots, kNoCard until the first fill
  int m_nNext = 0;
  int m_nCount;
  unsigned m_nShuffles = 1;
};

/// One deck, in order from the start.
class CSingleDeck : public CShoe {
 public:
  CSingleDeck() : CShoe(1) { Fill(); }
};

/// Four decks; has no cards before its first fill or shuffle.
class CFourDeckShoe : public CShoe {
 public:
  CFourDeckShoe() : CShoe(4) {}
};

/// Six decks; has no cards before its first fill or shuffle.
class CSixDeckShoe : public CShoe {
 public:
  CSixDeckShoe() : CShoe(6) {}
};

}  // namespace feltside
