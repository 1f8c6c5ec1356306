#include "platform/host/offscreen_host.h"

#include <chrono>

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
  using namespace std::chrono;
  const year_month_day set = year(m_clock.year) / m_clock.month / m_clock.day;
  const auto now = sys_days(set) + hours(m_clock.hour) + minutes(m_clock.minute) +
                   seconds(m_clock.second + (m_nTicks - m_nClockSetAt) / 1000);
  const auto today = floor<days>(now);
  const year_month_day date(today);
  const hh_mm_ss time(now - today);
  return {static_cast<int>(date.year()),
          static_cast<int>(static_cast<unsigned>(date.month())),
          static_cast<int>(static_cast<unsigned>(date.day())),
          static_cast<int>(time.hours().count()),
          static_cast<int>(time.minutes().count()),
          static_cast<int>(time.seconds().count())};
}

}  // namespace platform
