#include "platform/window/message_queue.h"

#include <algorithm>

#include "platform/host/host.h"

namespace platform {

void CMessageQueue::PostCommand(int commandID) { Post({MessageKind::kCommand, {}, commandID, 0}); }

void CMessageQueue::PostQuit(int exitCode) { Post({MessageKind::kQuit, {}, 0, exitCode}); }

bool CMessageQueue::Peek(Message& message) {
  Collect();
  if (m_arrMessages.empty()) return false;
  message = m_arrMessages.front();
  m_arrMessages.pop_front();
  return true;
}

void CMessageQueue::DropKeys() {
  Collect();
  const auto isKey = [](const Message& message) {
    return message.kind == MessageKind::kInput &&
           (message.input.kind == InputKind::kKey || message.input.kind == InputKind::kText);
  };
  m_arrMessages.erase(std::remove_if(m_arrMessages.begin(), m_arrMessages.end(), isKey),
                      m_arrMessages.end());
}

void CMessageQueue::Wait(int milliseconds) {
  Collect();
  if (m_arrMessages.empty()) TheHost().WaitEvent(milliseconds);
}

void CMessageQueue::Pause(int milliseconds) {
  const std::int64_t end = TheHost().Ticks() + milliseconds;
  for (std::int64_t left = milliseconds; left > 0; left = end - TheHost().Ticks()) {
    TheHost().WaitEvent(static_cast<int>(left));
    Collect();
  }
}

void CMessageQueue::Collect() {
  InputEvent event;
  while (TheHost().NextEvent(event)) {
    Message message;
    message.kind = event.kind == InputKind::kClose ? MessageKind::kClose : MessageKind::kInput;
    message.input = event;
    Post(message);
  }
}

}  // namespace platform
