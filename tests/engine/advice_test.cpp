#include "engine/advice.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>

#include "tests/engine/hands.h"

namespace feltside::tests {
namespace {

// A block of the strategy: hands from low to high against up cards from upLow to upHigh, the ace
// being 11. Where no block stands, the move is a hit.
struct Block {
  int low, high, upLow, upHigh;
  int move;
};

const std::vector<Block> kPairBlocks = {  // by rank
    {1, 1, 2, 11, ADVICE_SPLIT}, {2, 3, 2, 7, ADVICE_SPLIT},   {4, 4, 5, 6, ADVICE_SPLIT},
    {5, 5, 2, 9, ADVICE_DOUBLE}, {6, 6, 2, 6, ADVICE_SPLIT},   {7, 7, 2, 7, ADVICE_SPLIT},
    {8, 8, 2, 11, ADVICE_SPLIT}, {9, 9, 2, 6, ADVICE_SPLIT},   {9, 9, 8, 9, ADVICE_SPLIT},
    {9, 9, 7, 7, ADVICE_STAND},  {9, 9, 10, 11, ADVICE_STAND}, {10, 13, 2, 11, ADVICE_STAND}};
const std::vector<Block> kSoftBlocks = {  // by total
    {11, 12, 2, 11, ADVICE_NONE},  {13, 14, 5, 6, ADVICE_DOUBLE}, {15, 16, 4, 6, ADVICE_DOUBLE},
    {17, 18, 3, 6, ADVICE_DOUBLE}, {18, 18, 2, 2, ADVICE_STAND},  {18, 18, 7, 8, ADVICE_STAND},
    {19, 21, 2, 11, ADVICE_STAND}};
const std::vector<Block> kHardBlocks = {  // by total
    {9, 9, 3, 6, ADVICE_DOUBLE},  {10, 10, 2, 9, ADVICE_DOUBLE}, {11, 11, 2, 10, ADVICE_DOUBLE},
    {12, 12, 4, 6, ADVICE_STAND}, {13, 16, 2, 6, ADVICE_STAND},  {17, 99, 2, 11, ADVICE_STAND}};

int ExpectedMove(const CBlackjackHand& hand, int upCard) {
  const bool soft = hand.IsSoft() != 0;
  const bool pair = hand.IsPair() != 0;
  const int row = pair ? RankOf(hand.GetCard(0)) : hand.GetTotal();
  const int up = RankOf(upCard) == 1 ? 11 : std::min(RankOf(upCard), 10);
  for (const Block& b : pair ? kPairBlocks : soft ? kSoftBlocks : kHardBlocks) {
    if (b.low <= row && row <= b.high && b.upLow <= up && up <= b.upHigh) {
      return b.move == ADVICE_DOUBLE && hand.GetCount() > 2 ? ADVICE_HIT : b.move;
    }
  }
  return ADVICE_HIT;
}

void CheckAgainstEveryUpCard(const std::vector<int>& cards) {
  const std::array<const char*, 5> texts = {"untouched", "Hit", "Stand", "Split", "Double Down"};
  const auto hand = MakeHand<CBlackjackHand>(cards);
  for (int upCard = 1; upCard <= 52; ++upCard) {
    std::string text = "untouched";
    const int expected = ExpectedMove(hand, upCard);
    ASSERT_EQ(GetAdvice(hand, text, upCard), expected)
        << testing::PrintToString(cards) << " against " << upCard;
    ASSERT_EQ(text, texts[static_cast<std::size_t>(expected + 1)]);
  }
  std::string text = "untouched";
  EXPECT_EQ(GetAdvice(hand, text, kNoCard), ADVICE_NONE);
  EXPECT_EQ(text, "untouched");
}

TEST(Advice, FollowsTheStrategyForEveryHandOfUpToThreeCards) {
  CheckAgainstEveryUpCard({});
  for (int a = 1; a <= 13; ++a) {
    CheckAgainstEveryUpCard({a});
    for (int b = 14; b <= 26; ++b) {
      CheckAgainstEveryUpCard({a, b});
      for (int c = 27; c <= 39; ++c) {
        CheckAgainstEveryUpCard({a, b, c});
      }
    }
  }
}

}  // namespace
}  // namespace feltside::tests
