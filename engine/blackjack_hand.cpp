#include "engine/blackjack_hand.h"

namespace feltside {

namespace {

constexpr int kAceRaise = 10;  // what an ace counted as 11 adds to an ace counted as 1

}  // namespace

int CBlackjackHand::GetTotal() const { return HardTotal() + (IsSoft() != 0 ? kAceRaise : 0); }

int CBlackjackHand::IsPair() const {
  const int first = GetCard(0);
  const int second = GetCard(1);
  const bool twoCards = GetCount() == 2 && IsCard(first) && IsCard(second);
  return twoCards && RankOf(first) == RankOf(second) ? 1 : 0;
}

int CBlackjackHand::IsSoft() const {
  return HasAce() && HardTotal() + kAceRaise <= kTwentyOne ? 1 : 0;
}

int CBlackjackHand::HardTotal() const {
  int total = 0;
  for (int slot = 0; slot < GetCount(); ++slot) {
    total += PointsOf(GetCard(slot));
  }
  return total;
}

bool CBlackjackHand::HasAce() const {
  for (int slot = 0; slot < GetCount(); ++slot) {
    if (PointsOf(GetCard(slot)) == kAce) {
      return true;
    }
  }
  return false;
}

}  // namespace feltside
