#pragma once

#include <nlohmann/json.hpp>
#include <vector>

#include "table/feltside_view.h"

namespace feltside {

/// The table laid open for trying things out: its state to read, its money and its next cards to
/// set.
class CTableState {
 public:
  explicit CTableState(CFeltsideView& view) : m_view(view) {}

  /// Every member under its own name.
  nlohmann::ordered_json Read() const;
  double Wallet() const { return m_view.m_dWallet; }
  const CBlackjackHand& ActiveHand() const { return m_view.ActiveHand(); }
  int UpCard() const { return m_view.UpCard(); }
  void SetWallet(double dollars) { m_view.m_dWallet = dollars; }
  /// Puts cards next into the shoe of the selected game, so that the deal does not shuffle them
  /// away. Answers what is wrong, or an empty text when it was done.
  std::string Stack(const std::vector<int>& cards);

 private:
  CFeltsideView& m_view;
};

}  // namespace feltside
