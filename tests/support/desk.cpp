#include "tests/support/desk.h"

#include <stdexcept>

namespace feltside::tests {

DeskHost::DeskHost(std::unique_ptr<TemporaryFolder> folder)
    : OffscreenHost(folder->Path()), m_pFolder(std::move(folder)), m_previous(platform::TheHost()) {
  platform::SetHost(this);
}

void DeskHost::WaitEvent(int milliseconds) {
  if (milliseconds >= 0 && m_onPause) m_onPause();
  OffscreenHost::WaitEvent(milliseconds);
}

void DeskHost::PutPointer(platform::InputKind kind, platform::Point at) {
  platform::InputEvent event;
  event.kind = kind;
  event.at = at;
  PutInput(event);
}

void DeskHost::PutKey(const std::string& chord) {
  platform::InputEvent event;
  event.kind = platform::InputKind::kKey;
  const auto stroke = platform::ParseChord(chord);
  if (!stroke) throw std::invalid_argument(chord);
  event.stroke = *stroke;
  PutInput(event);
}

}  // namespace feltside::tests
