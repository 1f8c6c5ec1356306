#pragma once

#include "platform/draw/geometry.h"

namespace feltside {

// Numbers of the pictures that the table is drawn from. Card faces have their card's number, 1..52.

inline constexpr int kFirstCardBackID = 54;
inline constexpr int kLastCardBackID = 65;

inline constexpr int IDB_TABLE = 130;
inline constexpr int IDB_STRATEGY = 133;
inline constexpr int IDB_ACTIVE_MARK = 134;
inline constexpr int IDB_INSURANCE = 139;
inline constexpr int IDB_TITLE = 140;
inline constexpr int IDB_LAMP_GREEN = 141;
inline constexpr int IDB_POKER_TABLE = 142;
inline constexpr int IDB_NO_INSURANCE = 143;
inline constexpr int IDB_LAMP_RED = 144;

inline constexpr int IDI_BET_UP = 136;
inline constexpr int IDI_BET_DOWN = 137;
inline constexpr int IDI_BET_DOWN_OFF = 138;
inline constexpr int IDI_BET_UP_OFF = 139;

// Sizes in pixels.
inline constexpr platform::Size kTablePicture{240, 268};
inline constexpr platform::Size kPokerPicture{240, 270};
inline constexpr platform::Size kTitlePicture{96, 116};
inline constexpr platform::Size kStrategyPicture{24, 22};
inline constexpr platform::Size kInsurancePicture{73, 17};
inline constexpr platform::Size kNoInsurancePicture{55, 17};
inline constexpr platform::Size kBetIcon{16, 16};
inline constexpr platform::Size kActiveMark{8, 4};
inline constexpr platform::Size kLamp{13, 13};

}  // namespace feltside
