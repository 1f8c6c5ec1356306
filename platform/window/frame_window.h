#pragma once

#include <memory>
#include <string>
#include <vector>

#include "platform/window/command.h"
#include "platform/window/command_bar.h"
#include "platform/window/top_window.h"
#include "platform/window/view.h"

namespace platform {

/// A key that stands for a command.
struct Accelerator {
  KeyStroke stroke;
  int commandID = 0;
};

/// The main window: a command bar above, the view below. It hands commands to whoever knows them:
/// the view, then the frame itself, then the application.
///
/// While it is disabled, by a dialog or by the game, no command runs and no input arrives.
class CFrameWindow : public CTopWindow, public CCommandTarget {
 public:
  /// Below this lies the view, in pixels.
  static constexpr int kBarHeight = 26;

  CFrameWindow(const std::string& title, std::vector<Accelerator> accelerators);

  /// Builds the frame's own parts; 0, or -1 to give the frame up.
  virtual int OnCreate() { return 0; }

  /// Takes the view, once, and gives it the keyboard.
  void SetView(std::unique_ptr<CView> view);
  /// There must be one.
  CView& View() const { return *m_pView; }
  /// Where the view stands in the frame.
  Rect ViewPlace() const;

  /// Whether a command may run now, asked afresh.
  bool IsCommandEnabled(int commandID);
  /// Asks and, if it may, runs a command; returns whether it ran.
  bool ExecuteCommand(int commandID);
  /// The key that stands for a command, as a person reads it; empty for none.
  std::string KeyOf(int commandID) const;
  /// Has the tool bar show which commands may run.
  virtual void RefreshCommandStates() {}

  /// Those of the view.
  Phrases Words() const override { return m_pView->Words(); }
  bool OnKeyDown(const KeyStroke& stroke) override;

 private:
  /// Who runs a command now; null where nobody may.
  CCommandTarget* TargetOf(int commandID);

  std::vector<Accelerator> m_arrAccelerators;
  std::unique_ptr<CView> m_pView;
};

}  // namespace platform
