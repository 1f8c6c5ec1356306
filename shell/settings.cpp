// The player's choices as they are read from the profile into the table.

#include "shell/settings.h"

#include <array>

#include "platform/window/application.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

constexpr platform::Color kDefaultTable = platform::Rgb(0, 155, 0);
constexpr platform::Color kDefaultBox = platform::Rgb(135, 180, 100);
constexpr int kLastColor = 0xFFFFFF;

/// The dealer's pause in milliseconds by play speed: slow, normal, fast.
constexpr std::array<int, 3> kDealerDelays = {2000, 1000, 200};
constexpr int kNormalSpeed = 1;

int ReadSetting(const char* entry, int absent) {
  return platform::TheApp().Profile().GetInt(kSettingsSection, entry, absent);
}

/// A value outside its range counts as absent.
int ReadInRange(const char* entry, int lowest, int highest, int absent) {
  const int value = ReadSetting(entry, absent);
  return value < lowest || value > highest ? absent : value;
}

platform::Color ReadColor(const char* entry, platform::Color absent) {
  return static_cast<platform::Color>(ReadInRange(entry, 0, kLastColor, static_cast<int>(absent)));
}

}  // namespace

void CFeltsideView::LoadSettings() {
  const int gameType = ReadInRange("GAME_TYPE", kGameBlackjack, kGameVideoPoker, kGameBlackjack);
  // A hand that is being played is played out in its own game.
  if (m_bHandInProgress == 0) m_nGameType = gameType;
  m_bUseHighScores = ReadInRange("USEHIGH", 0, 1, 1);
  m_bFancyPoker = ReadInRange("FANCYVP", 0, 1, 1);
  m_bFancyBlackjack = ReadInRange("FANCYBJ", 0, 1, 1);
  m_layout.m_nCardBackID =
      ReadInRange("CARDBACK", kFirstCardBackID, kLastCardBackID, kFirstCardBackID);
  m_layout.m_crTable = ReadColor("TABLECOLOR", kDefaultTable);
  m_layout.m_crBox = ReadColor("BOXCOLOR", kDefaultBox);
  m_nMaxDiscards = ReadInRange("VIDEODISCARDS", 0, kPokerCards, 3);
  m_nStrategyMode = ReadInRange("STRATTYPE", kStrategyNone, kStrategyAlways, kStrategyButton);
  m_nDeckChoice = ReadInRange("NUMDECKS", 0, 2, 1);
  SetPlaySpeed(ReadSetting("PLAYSPEED", kNormalSpeed));
}

void CFeltsideView::SetPlaySpeed(int speed) {
  if (speed < 0 || speed >= static_cast<int>(kDealerDelays.size())) return;
  m_nDealerDelay = kDealerDelays[static_cast<std::size_t>(speed)];
}

int CFeltsideView::PlaySpeed() const {
  for (std::size_t speed = 0; speed < kDealerDelays.size(); ++speed) {
    if (kDealerDelays[speed] == m_nDealerDelay) return static_cast<int>(speed);
  }
  return -1;
}

}  // namespace feltside
