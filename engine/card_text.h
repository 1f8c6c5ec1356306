#pragma once

#include <string>

namespace feltside {

/// The card that a word means, such as "AS", "10h" or "td": a rank (A, 2 to 10, T, J, Q or K) and a
/// suit (C, D, H or S), in capitals or not. kNoCard for any other word.
int CardFromText(const std::string& word);

/// A card as it is spoken of: "ten of hearts"; "no card" for what is none.
std::string CardName(int card);

}  // namespace feltside
