#pragma once

namespace platform {

/// What a command target says when it is asked whether a command may run.
enum class CommandState {
  kUnknown,  ///< not a command of this target; ask the next one
  kDisabled,
  kEnabled,
};

/// Something that handles commands: the view, the frame, the application.
class CCommandTarget {
 public:
  virtual ~CCommandTarget() = default;
  virtual CommandState QueryCommand(int) const { return CommandState::kUnknown; }
  /// Runs a command that QueryCommand has just called enabled.
  virtual void RunCommand(int) {}
};

/// A line of a target's command map.
template <class Target>
struct CommandEntry {
  int commandID = 0;
  void (Target::*handler)() = nullptr;
  bool (Target::*isEnabled)() const = nullptr;  ///< null: always
};

/// The answer of a target whose commands stand in a map.
template <class Target, class Map>
CommandState QueryCommandMap(const Target& target, const Map& map, int commandID) {
  for (const auto& entry : map) {
    if (entry.commandID != commandID) continue;
    const bool enabled = entry.isEnabled == nullptr || (target.*entry.isEnabled)();
    return enabled ? CommandState::kEnabled : CommandState::kDisabled;
  }
  return CommandState::kUnknown;
}

template <class Target, class Map>
void RunCommandMap(Target& target, const Map& map, int commandID) {
  for (const auto& entry : map) {
    if (entry.commandID == commandID) return (target.*entry.handler)();
  }
}

/// The framework's own commands.
inline constexpr int kCommandNew = 57600;
inline constexpr int kCommandOpen = 57601;
inline constexpr int kCommandAbout = 57664;
inline constexpr int kCommandExit = 57665;

}  // namespace platform
