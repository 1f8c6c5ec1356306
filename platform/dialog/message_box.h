#pragma once

#include <string>

namespace platform {

enum class MessageBoxButtons { kOk, kYesNo };

enum class MessageBoxResult { kOk = 1, kCancel = 2, kYes = 6, kNo = 7 };

/// Shows a text, whose '&' is a sign like any other, over everything else and returns once a button
/// was pushed or the program is to end. Escape gives kCancel where there is only OK, kNo where
/// there is a question.
MessageBoxResult MessageBox(const std::string& text,
                            MessageBoxButtons buttons = MessageBoxButtons::kOk);

}  // namespace platform
