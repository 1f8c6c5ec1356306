// This stands in place of the system's function.

#include <unistd.h>

#include <ctime>
#include <utility>

#include "tests/platform/failing_machine.h"

using namespace feltside::tests;

extern "C" int usleep(useconds_t microseconds) {
  if (g_bSleepsInNoTime) {
    g_nMicrosecondsSlept += static_cast<long>(microseconds);
    if (g_afterSleep) std::exchange(g_afterSleep, nullptr)();
    return 0;
  }
  const timespec time{0, static_cast<long>(microseconds) * 1000};
  return nanosleep(&time, nullptr);
}
