// Any settings' file through the whole program: it starts and plays, what it cannot understand is
// kept, and what it stores it finds again.

#include <algorithm>

#include "fuzz/bytes.h"
#include "fuzz/session.h"
#include "platform/store/toml_text.h"

namespace feltside::fuzz {
namespace {

/// The first "press 1" is for the box that tells of trouble, if there is one.
const std::vector<std::string> kPlay = {
    "press 1",    "command deal", "command stand",      "command table-setup",
    "press 1",    "key Ctrl+N",   "command game-setup", "press 1",
    "wallet 250", "command exit", "type Ann",           "press 1",
    "press 1"};

/// Whatever the table holds in the end that comes from the settings.
nlohmann::json SettingsIn(const std::vector<nlohmann::json>& answers) {
  const auto state = *std::find_if(answers.rbegin(), answers.rend(),
                                   [](const auto& answer) { return answer.contains("m_layout"); });
  nlohmann::json settings;
  for (const char* member : {"m_nGameType", "m_bUseHighScores", "m_bFancyPoker", "m_nMaxDiscards",
                             "m_bFancyBlackjack", "m_nStrategyMode", "m_nDeckChoice"}) {
    settings[member] = state.at(member);
  }
  for (const char* member : {"m_crTable", "m_crBox", "m_nCardBackID"}) {
    settings[member] = state["m_layout"].at(member);
  }
  return settings;
}

void Play(const std::string& text) {
  const CSession session(text);
  const auto last = SettingsIn(session.Play(kPlay));
  const auto kept = session.Kept();
  const bool isUnderstood = platform::ReadSections(text).has_value();
  Require(isUnderstood || kept == std::vector{text}, "does not keep what is damaged");
  const std::string stored = session.Settings();
  Require(platform::ReadSections(stored).has_value(), "stores what it cannot read");
  Require(SettingsIn(session.Play({"state"})) == last, "starts with other settings");
  Require(session.Settings() == stored && session.Kept() == kept, "changes its own file");
}

}  // namespace
}  // namespace feltside::fuzz

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  feltside::fuzz::Play(std::string(reinterpret_cast<const char*>(data), size));
  return 0;
}
