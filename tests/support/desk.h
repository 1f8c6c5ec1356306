#pragma once

#include <functional>
#include <memory>
#include <utility>

#include "platform/application.h"
#include "platform/offscreen_host.h"
#include "tests/support/temporary_folder.h"

namespace feltside::tests {

/// A machine with a profile of its own; for as long as it lives it is the host of this process.
class DeskHost : public platform::OffscreenHost {
 public:
  DeskHost() : DeskHost(std::make_unique<TemporaryFolder>()) {}
  ~DeskHost() override { platform::SetHost(&m_previous); }

  /// Called whenever the program waits for a time to pass.
  void SetPauseHandler(std::function<void()> onPause) { m_onPause = std::move(onPause); }
  void WaitEvent(int milliseconds) override;

  void PutPointer(platform::InputKind kind, platform::Point at);
  void PutKey(const std::string& chord);

 private:
  explicit DeskHost(std::unique_ptr<TemporaryFolder> folder);

  std::unique_ptr<TemporaryFolder> m_pFolder;
  platform::Host& m_previous;
  std::function<void()> m_onPause;
};

/// A program that runs in this process, from one idle moment to the next, so that a test may put
/// whatever it likes into its queue in between.
template <class App>
class Desk {
 public:
  explicit Desk(const std::string& profile = {}) {
    if (!profile.empty()) {
      WriteFile(m_host.ProfileFolder() / "Quillworks" / "Feltside.toml", profile);
    }
    // A window that waits for an answer, with nobody to give it, is closed.
    m_host.SetIdleHandler([this] { return !std::exchange(m_bIdle, true); });
    m_pApp = std::make_unique<Started>();
  }

  DeskHost& Host() { return m_host; }
  App& Program() { return *m_pApp; }

  /// Lets the program handle all that waits; answers whether it still runs.
  bool RunUntilIdle() {
    m_bIdle = false;
    m_pApp->RunUntil([this] { return m_bIdle; });
    return m_bIdle;
  }

 private:
  struct Started : App {
    Started() { this->InitInstance(); }
  };

  DeskHost m_host;
  std::unique_ptr<Started> m_pApp;
  bool m_bIdle = false;
};

}  // namespace feltside::tests
