#pragma once

#include <functional>
#include <string>

#include "platform/dialog/dialog.h"
#include "platform/host/offscreen_host.h"
#include "shell/feltside_app.h"
#include "stylus/table_state.h"
#include "tests/support/stylus.h"

namespace feltside::tests {

/// A machine with a profile of its own; for as long as it lives it is the host of this process.
class DeskHost : private TemporaryFolder, public platform::OffscreenHost {
 public:
  DeskHost() : OffscreenHost(Path()) { platform::SetHost(this); }
  ~DeskHost() override { platform::SetHost(&m_previous); }

  /// Called whenever the program waits for a time to pass.
  void SetPauseHandler(std::function<void()> onPause) { m_fnOnPause = std::move(onPause); }
  /// Called after every picture that is shown.
  void SetFrameHandler(std::function<void()> onFrame) { m_fnOnFrame = std::move(onFrame); }
  void Show(const platform::CBitmap& frame) override;
  void WaitEvent(int milliseconds) override;
  /// What keeps help viewers from coming up from now on.
  void SetHelpTrouble(const std::string& trouble) { m_strHelpTrouble = trouble; }
  std::string StartHelpViewer(const std::string&) override { return m_strHelpTrouble; }
  void PutPointer(platform::InputKind kind, platform::Point at);
  void PutKey(const std::string& chord);

 private:
  platform::Host& m_previous = platform::TheHost();
  std::function<void()> m_fnOnPause;
  std::function<void()> m_fnOnFrame;
  std::string m_strHelpTrouble;
};

/// The game in this process, worked with messages and input from one idle moment to the next, with
/// whatever dialogs are open by then. It runs in a thread of its own, as an open dialog does not
/// return, but never at the same time as the test. It is closed when this object goes.
class Desk {
 public:
  /// Starts the game with this text as its settings' file.
  explicit Desk(const std::string& profile = {});
  ~Desk();
  Desk(const Desk&) = delete;
  Desk& operator=(const Desk&) = delete;

  DeskHost& Host() { return m_host; }
  CTableState Table() const;
  /// The members of the table.
  Json State() const;
  /// The topmost window, which must be a dialog.
  platform::CDialog* Dialog() const;

  /// Puts a message behind those that wait.
  static void Post(const platform::Message& message);
  /// Lets the game handle all that waits; returns whether it still runs.
  bool Run();
  /// Both for a command.
  void Command(int commandID);

 private:
  DeskHost m_host;
  bool m_bLeaving = false;
  bool m_bRunning = true;
};

}  // namespace feltside::tests
