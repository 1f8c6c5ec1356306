#pragma once

#include <string>
#include <vector>

#include "platform/dialog.h"
#include "shell/feltside_app.h"
#include "tests/support/desk.h"
#include "tests/support/stylus.h"

namespace feltside::tests {

/// The game in this process, worked with pointer and keys from one idle moment to the next, with
/// whatever dialogs are open by then. It runs in a thread of its own, as an open dialog does not
/// return, but never at the same time as the test. It is closed when this object goes.
class DialogDesk {
 public:
  explicit DialogDesk(const std::string& profile = {});
  ~DialogDesk();
  DialogDesk(const DialogDesk&) = delete;
  DialogDesk& operator=(const DialogDesk&) = delete;

  DeskHost& Host() { return m_host; }
  const platform::CBitmap& Shown() const { return m_host.Shown(); }
  bool IsRunning() const { return m_bRunning; }
  /// The members of the table.
  Json Table() const;

  // Each of these returns once the program is idle again.

  void Command(int commandID);
  void Press(platform::Point at) { Pointer(platform::InputKind::kPointerDown, at); }
  void Move(platform::Point at) { Pointer(platform::InputKind::kPointerMove, at); }
  void Release(platform::Point at) { Pointer(platform::InputKind::kPointerUp, at); }
  void Tap(platform::Point at);
  void Wheel(platform::Point at, int notches);
  void Type(const std::string& text);
  /// Chords with blanks between them; what begins with an apostrophe is typed instead.
  void Keys(const std::string& strokes);
  void Wallet(double dollars);

  /// Titles, bottom to top; an open list has none.
  std::vector<std::string> Windows() const;
  /// The topmost dialog; null while there is none.
  platform::CDialog* Dialog() const;
  platform::CControl& Control(int controlID) const { return *Dialog()->GetDlgItem(controlID); }
  /// In pixels of the whole window.
  platform::Rect Place(const platform::CControl& control) const;
  platform::Point Middle(int controlID) const;
  /// The number of the control that has the keyboard; 0 for none.
  int Focus() const;

 private:
  void Pointer(platform::InputKind kind, platform::Point at);

  DeskHost m_host;
  bool m_bLeaving = false;
  bool m_bRunning = true;
};

/// Sees every write of the profile and takes the file away right after it, so that each write shows
/// by itself what it wrote. One at a time.
class WriteWatch {
 public:
  WriteWatch();
  ~WriteWatch();
  WriteWatch(const WriteWatch&) = delete;
  WriteWatch& operator=(const WriteWatch&) = delete;

  /// The written files without their section's heading, oldest first, since the last call.
  std::vector<std::string> Take();
};

/// A control in the state of the topmost dialog.
Json ControlOf(const Json& state, int number);

/// The lines of a profile without its section's heading.
std::vector<std::string> SettingsIn(const std::string& profile);

}  // namespace feltside::tests
