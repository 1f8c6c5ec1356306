#include "engine/card_text.h"

#include <array>

#include "engine/card_hand.h"

namespace feltside {
namespace {

constexpr std::size_t kNowhere = std::string::npos;

std::size_t PlaceAmong(const std::string& capitals, char letter) {
  const bool small = letter >= 'a' && letter <= 'z';
  return capitals.find(small ? static_cast<char>(letter - 'a' + 'A') : letter);
}

/// From 0 for the ace.
std::size_t PlaceOfRank(const std::string& text) {
  const std::string ranks = "A23456789TJQK";
  if (text == "10") return ranks.find('T');
  return text.size() == 1 ? PlaceAmong(ranks, text[0]) : kNowhere;
}

}  // namespace

int CardFromText(const std::string& word) {
  if (word.empty()) return kNoCard;
  const std::size_t suit = PlaceAmong("CDHS", word.back());
  const std::size_t rank = PlaceOfRank(word.substr(0, word.size() - 1));
  if (suit == kNowhere || rank == kNowhere) return kNoCard;
  return static_cast<int>(suit * kRanks + rank + 1);
}

std::string CardName(int card) {
  constexpr std::array<const char*, kRanks> kRankNames = {"ace",  "two",   "three", "four", "five",
                                                          "six",  "seven", "eight", "nine", "ten",
                                                          "jack", "queen", "king"};
  constexpr std::array<const char*, kSuits> kSuitNames = {"spades", "hearts", "diamonds", "clubs"};
  if (!IsCard(card)) return "no card";
  return std::string(kRankNames[static_cast<std::size_t>(RankOf(card) - 1)]) + " of " +
         kSuitNames[static_cast<std::size_t>(CCardHand::GetSuit(card))];
}

}  // namespace feltside
