// The player's choices as they are kept in the profile and held by the table.

#include "shell/settings.h"

#include <array>
#include <cstddef>
#include <limits>
#include <type_traits>
#include <utility>

#include "shell/feltside_app.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

constexpr int kDefaultTable = platform::Rgb(0, 155, 0);
constexpr int kDefaultBox = platform::Rgb(135, 180, 100);
constexpr int kLastColor = 0xFFFFFF;
constexpr int kLeast = std::numeric_limits<int>::min();
constexpr int kMost = std::numeric_limits<int>::max();

/// The dealer's pause in milliseconds by play speed: slow, normal, fast.
constexpr std::array<int, 3> kDealerDelays = {2000, 1000, 200};

}  // namespace

struct CFeltsideView::Settings {
  using View = CFeltsideView;

  struct Entry {
    const char* name;
    int lowest, highest;  ///< what lies outside counts as absent
    int absent;           ///< the default
    int (*get)(const View&);
    void (*set)(View&, int);

    void Load(View& view, const platform::CProfileSection& stored) const {
      const int value = stored.GetInt(name, absent);
      set(view, value >= lowest && value <= highest ? value : absent);
    }
  };

  // Of a member that is named by its path: of a member of the view, or of a member of one.
  template <auto... Path>
  static int Get(const View& view) {
    return static_cast<int>((view.*....*Path));
  }
  template <auto... Path>
  static void Set(View& view, int value) {
    auto& member = (view.*....*Path);
    member = static_cast<std::remove_reference_t<decltype(member)>>(value);
  }
  template <auto... Path>
  static constexpr Entry Of(const char* name, int lowest, int highest, int absent) {
    return {name, lowest, highest, absent, &Get<Path...>, &Set<Path...>};
  }

  /// A hand that is being played is played out in its own game.
  static void SetGameType(View& view, int gameType) {
    if (view.m_bHandInProgress == 0) view.m_nGameType = gameType;
  }
  static int GetPlaySpeed(const View& view) { return view.PlaySpeed(); }
  static void SetPlaySpeed(View& view, int speed) { view.SetPlaySpeed(speed); }

  static const std::array<Entry, kSettingCount> kAll;
};

/// One for each Setting, in their order.
constexpr std::array<CFeltsideView::Settings::Entry, kSettingCount> CFeltsideView::Settings::kAll =
    {{
        {"GAME_TYPE", kGameBlackjack, kGameVideoPoker, kGameBlackjack, &Get<&View::m_nGameType>,
         &SetGameType},
        Of<&View::m_bUseHighScores>("USEHIGH", 0, 1, 1),
        Of<&View::m_bFancyPoker>("FANCYVP", 0, 1, 1),
        Of<&View::m_bFancyBlackjack>("FANCYBJ", 0, 1, 1),
        Of<&View::m_layout, &CTableLayout::m_nCardBackID>("CARDBACK", kFirstCardBackID,
                                                          kLastCardBackID, kFirstCardBackID),
        Of<&View::m_layout, &CTableLayout::m_crTable>("TABLECOLOR", 0, kLastColor, kDefaultTable),
        Of<&View::m_layout, &CTableLayout::m_crBox>("BOXCOLOR", 0, kLastColor, kDefaultBox),
        Of<&View::m_nMaxDiscards>("VIDEODISCARDS", 0, kPokerCards, 3),
        Of<&View::m_nStrategyMode>("STRATTYPE", kStrategyNone, kStrategyAlways, kStrategyButton),
        Of<&View::m_nDeckChoice>("NUMDECKS", 0, 2, 1),
        {"PLAYSPEED", kLeast, kMost, 1, &GetPlaySpeed, &SetPlaySpeed},
    }};

void CFeltsideView::LoadSettings() {
  const platform::CProfileSection& stored = TheFeltsideApp().ReadSettings();
  for (const Settings::Entry& setting : Settings::kAll) setting.Load(*this, stored);
  m_bSettingsUnread = TheFeltsideApp().HasReadSettings() ? 0 : 1;
}

void CFeltsideView::LoadUnreadSettings(const platform::CProfileSection& stored) {
  if (std::exchange(m_bSettingsUnread, 0) == 0) return;
  for (const Settings::Entry& setting : Settings::kAll) {
    if (setting.get(*this) == setting.absent) setting.Load(*this, stored);
  }
}

void CFeltsideView::StoreSettings(std::initializer_list<Setting> settings) {
  TheFeltsideApp().Profile().Update(kSettingsSection, [&](platform::CProfileSection& stored) {
    LoadUnreadSettings(stored);
    for (const Setting setting : settings) {
      const Settings::Entry& entry = Settings::kAll[static_cast<std::size_t>(setting)];
      stored.Set(entry.name, entry.get(*this));
    }
  });
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
