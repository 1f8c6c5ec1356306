#pragma once

#include <deque>

#include "platform/host/input.h"

namespace platform {

enum class MessageKind {
  kInput,
  kCommand,  ///< a tool-bar button, menu item or accelerator was chosen
  kClose,    ///< the main window is to be closed
  kQuit,     ///< the program is to end
};

struct Message {
  MessageKind kind = MessageKind::kInput;
  InputEvent input;
  int commandID = 0;
  int exitCode = 0;
};

/// The messages that wait to be handled, oldest first, and the one place where the layer waits.
class CMessageQueue {
 public:
  /// Puts a message behind those that wait.
  void Post(const Message& message) { m_arrMessages.push_back(message); }
  void PostCommand(int commandID);
  void PostQuit(int exitCode);

  /// Takes the oldest waiting message, input that has come included. Does not wait; false: there
  /// is none.
  bool Peek(Message& message);
  /// Forgets the keys and texts that wait.
  void DropKeys();
  /// Waits until there may be a message, or so many milliseconds; below 0: however long it takes.
  void Wait(int milliseconds);
  /// Waits so many milliseconds and collects what comes meanwhile.
  void Pause(int milliseconds);

 private:
  void Collect();

  std::deque<Message> m_arrMessages;
};

}  // namespace platform
