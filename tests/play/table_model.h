#pragma once

#include <string>

#include "tests/support/stylus.h"

namespace feltside::tests {

/// The member that holds the shoe which blackjack deals from.
const char* SelectedShoe(const Json& state);

/// A second opinion on the table: from one state to the next it works out by itself what money the
/// deal moved, and says where a state cannot be.
class TableModel {
 public:
  explicit TableModel(const Json& first) : m_before(first), m_dWallet(first["m_dWallet"]) {}

  /// Takes the next state after this command. Answers what is wrong with it; empty: nothing.
  std::string Next(const std::string& command, const Json& state);

  int Settled() const { return m_nSettled; }  ///< the deals that were seen to their end

 private:
  bool WasDealt(const std::string& command, const Json& state) const;
  double BlackjackMoney(const Json& state, bool dealt) const;
  double PokerMoney(const Json& state) const;

  Json m_before;
  double m_dWallet;
  int m_nSettled = 0;
};

}  // namespace feltside::tests
