#include "platform/message_box.h"

#include <iostream>
namespace platform {
MessageBoxResult MessageBox(const std::string& text, MessageBoxButtons) {
  std::cerr << text << '\n';
  return MessageBoxResult::kOk;
}
}  // namespace platform
