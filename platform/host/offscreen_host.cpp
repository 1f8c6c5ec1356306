#include "platform/host/offscreen_host.h"

#include <ctime>

namespace platform {

bool OffscreenHost::NextEvent(InputEvent& event) {
  if (m_arrInput.empty()) return false;
  event = m_arrInput.front();
  m_arrInput.pop_front();
  return true;
}

void OffscreenHost::WaitEvent(int milliseconds) {
  if (milliseconds >= 0) {
    m_nTicks += milliseconds;
    return;
  }
  if (m_fnOnIdle && m_fnOnIdle()) return;
  InputEvent close;
  close.kind = InputKind::kClose;
  PutInput(close);
}

void OffscreenHost::SetClock(const LocalTime& now) {
  m_clock = now;
  m_nClockSetAt = m_nTicks;
}

LocalTime OffscreenHost::Now() {
  std::tm time{};
  time.tm_year = m_clock.year - 1900;
  time.tm_mon = m_clock.month - 1;
  time.tm_mday = m_clock.day;
  time.tm_hour = m_clock.hour;
  time.tm_min = m_clock.minute;
  time.tm_sec = m_clock.second + static_cast<int>((m_nTicks - m_nClockSetAt) / 1000);
  timegm(&time);
  return {time.tm_year + 1900, time.tm_mon + 1, time.tm_mday,
          time.tm_hour,        time.tm_min,     time.tm_sec};
}

}  // namespace platform
