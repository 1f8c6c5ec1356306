#pragma once

#include <functional>

namespace feltside::tests {

// A machine that fails on demand, for the whole program in which this is linked.

inline bool g_bReadFails = false;
inline bool g_bFlushFails = false;
inline int g_nAllocationsLeft = 0;      ///< the last of so many fails
inline int g_nBeforeRefusal = -1;       ///< so many that do not throw still succeed; below 0: all
inline bool g_bRefusesOnce = false;     ///< only the one after those fails
inline bool g_bSleepsInNoTime = false;  ///< usleep only moves the clock
inline long g_nMicrosecondsSlept = 0;   ///< in that way
inline std::function<void(int descriptor)> g_onFlush;  ///< sees what is being flushed
inline std::function<void()> g_afterSleep;             ///< happens once, during the next such sleep

}  // namespace feltside::tests
