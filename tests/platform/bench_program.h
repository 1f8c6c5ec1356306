#pragma once

#include <memory>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "platform/application.h"
#include "platform/command_bar.h"
#include "platform/frame_window.h"

namespace feltside::tests {

// The commands of the program below, by who handles them.
inline constexpr int kViewCommand = 101;
inline constexpr int kDisablingCommand = 102;  ///< the view's; disables kViewCommand
inline constexpr int kFrameCommand = 103;
inline constexpr int kProgramCommand = 104;
inline constexpr int kNobodysCommand = 105;

/// A program with a menu, a tool bar and a view that does nothing but remember.
///
/// The menu "&File" holds "&One" (the view's command), "&Two" (the disabling one), a separator,
/// "Frame" and "E&xit"; the tool bar the view's two commands with a separator in between. Ctrl+N
/// stands for the view's command.
class BenchProgram : public platform::CApplication {
 public:
  BenchProgram();

  platform::CommandState QueryCommand(int commandID) const override;
  void RunCommand(int commandID) override;

  /// What happened since the last call: "run 101", "tap 3 4", "key K", ...
  std::vector<std::string> TakeLog() { return std::exchange(m_log, {}); }
  void Remember(const std::string& what) { m_log.push_back(what); }
  std::set<int>& Disabled() { return m_disabled; }

 protected:
  bool InitInstance() override;

 private:
  std::vector<std::string> m_log;
  std::set<int> m_disabled;
};

}  // namespace feltside::tests
