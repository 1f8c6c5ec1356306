#pragma once

#include <functional>
#include <string>
#include <vector>

#include "platform/host/offscreen_host.h"
#include "shell/feltside_app.h"
#include "stylus/table_state.h"

namespace feltside::bench {

/// The game in this process, with settings of its own, taken by stylus lines ("stack", "command"
/// and "key") to where something is to be measured. Its host shows nothing: what that costs is the
/// machine's business.
class CGame : private platform::OffscreenHost {
 public:
  CGame(const std::string& settings, std::vector<std::string> lines);
  ~CGame() override;

  /// Runs the game from its start to its end, with the measurement in an idle moment in the middle.
  void Run(const std::function<void()>& measure);

  static CFeltsideView& View();
  /// Handles a command, and whatever follows from it, at once.
  static void Do(int commandID);

 private:
  void Show(const platform::CBitmap&) override {}
  void Give(const std::string& line);

  std::vector<std::string> m_lines;
  std::size_t m_nGiven = 0;
};

}  // namespace feltside::bench
