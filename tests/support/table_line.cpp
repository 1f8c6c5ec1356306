#include "tests/support/table_line.h"

#include <sstream>
#include <vector>

#include "table/command_ids.h"

namespace feltside::tests {
namespace {

std::string JoinWords(const std::vector<std::string>& words) {
  std::string text;
  for (const std::string& word : words) {
    if (!word.empty()) text += (text.empty() ? "" : " ") + word;
  }
  return text;
}

std::string Dollars(double amount) {
  std::ostringstream text;
  text << amount;
  return text.str();
}

std::string Flags(const Json& state) {
  const auto word = [&state](const char* member, const char* name) {
    return std::string(state[member] == 1 ? name : "");
  };
  return JoinWords({word("m_bInsuranceTaken", "insured"), word("m_bDoubledPlayer", "doubled"),
                    word("m_bPlayingSplit", "second"), word("m_bDoubledSplit", "doubled second")});
}

std::string Moves(const Json& state) {
  const Json& enabled = state["enabled"];
  if (state["m_bInsuranceOffered"] == 1) return "Insurance?";
  const auto move = [&enabled](int commandID, const char* name) {
    return std::string(enabled.at(std::to_string(commandID)) ? name : "");
  };
  return move(kCommandHit, "H") + move(kCommandStand, "S") + move(kCommandDoubleDown, "D") +
         move(kCommandSplit, "P") + move(kCommandDeal, "Deal");
}

}  // namespace

std::string TableLine(const Json& state) {
  const auto text = [&state](const char* member) { return state[member].get<std::string>(); };
  std::string line = Dollars(state["m_dWallet"]);
  for (const std::string& field : {JoinWords({text("m_strPlayerScore"), text("m_strPlayerMsg")}),
                                   JoinWords({text("m_strSplitScore"), text("m_strSplitMsg")}),
                                   text("m_strDealerScore"), Flags(state), Moves(state)}) {
    line += field.empty() ? " |" : " | " + field;
  }
  return line;
}

}  // namespace feltside::tests
