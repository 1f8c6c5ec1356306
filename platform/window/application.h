#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "platform/draw/resources.h"
#include "platform/store/profile.h"
#include "platform/window/command.h"
#include "platform/window/message_queue.h"
#include "platform/window/narrator.h"
#include "platform/window/screen.h"

namespace platform {

class CFrameWindow;
class CSingleDocTemplate;

/// The program: its message loop, its screen, its resources and its profile. One object exists for
/// the life of the process; it is declared after the host.
class CApplication : public CCommandTarget {
 public:
  /// The name is also the one of the settings' file; the window is of that size, in pixels, for as
  /// long as the program runs.
  CApplication(std::string name, EmbeddedFiles resources, Size windowSize);
  ~CApplication() override;
  CApplication(const CApplication&) = delete;
  CApplication& operator=(const CApplication&) = delete;

  /// Starts the program, runs it to its end and returns the exit code. Once only.
  int Main();

  /// Also the title of message boxes and the name of the settings' file.
  const std::string& Name() const { return m_strName; }
  CMessageQueue& Queue() { return m_queue; }
  CScreen& Screen() { return m_screen; }
  CResources& Resources() { return m_resources; }
  /// Where the player's choices are kept; SetRegistryKey comes first.
  CProfile& Profile() { return *m_pProfile; }
  /// Null until the main window is shown.
  CFrameWindow* MainFrame() const { return m_pMainFrame; }

  /// Has trouble told to the person, in a sentence, once in a run: when the program lies idle and
  /// can be interrupted, at the latest when it ends. The error stream is the caller's.
  void Notify(const std::string& trouble);
  /// Has all that the topmost window shows put into words, also what was told before.
  void TellAnew() { m_narrator.Forget(); }
  /// Opens the help viewer; trouble with it is notified.
  void ShowHelp(const std::string& commandLine);

  /// Handles one message. kQuit is not for here.
  void Dispatch(const Message& message);
  /// Runs messages until the condition holds or the program is to end. May be nested: each modal
  /// dialog has a loop of its own.
  void RunUntil(const std::function<bool()>& done);

 protected:
  /// Builds the program's window; false ends the program at once.
  virtual bool InitInstance() = 0;
  /// What is to be done at the end; returns the exit code.
  virtual int ExitInstance() { return m_nExitCode; }

  /// Whether what the person does may be interrupted by a notice now.
  virtual bool CanShowNotice() const = 0;
  /// Shows a notice and returns when it was read.
  virtual void ShowNotice(const std::string& trouble) = 0;

  /// Names the maker under whose folder the settings lie.
  void SetRegistryKey(const std::string& key);
  /// The one kind of document that the program has.
  void AddDocTemplate(std::unique_ptr<CSingleDocTemplate> docTemplate);
  /// Opens a new document, as a start without arguments does; false when that fails.
  bool OpenNewDocument();
  /// Puts the document's frame on the screen, with its title and icon, and paints it at once.
  void ShowMainWindow(int iconID);

 private:
  void OnIdle();
  void Refresh();
  bool HasNotice() const { return m_nShownNotices < m_arrNotices.size(); }
  void TakeTroubles();
  void ShowNextNotice();

  std::string m_strName;
  CResources m_resources;
  CMessageQueue m_queue;
  CScreen m_screen;
  CNarrator m_narrator;
  std::unique_ptr<CProfile> m_pProfile;
  std::unique_ptr<CSingleDocTemplate> m_pDocTemplate;
  CFrameWindow* m_pMainFrame = nullptr;
  std::vector<std::string> m_arrNotices;  ///< of the whole run
  std::size_t m_nShownNotices = 0;        ///< the first so many of them
  bool m_bShowingNotice = false;
  bool m_bQuit = false;
  int m_nExitCode = 0;
};

/// The application object of this process; it must exist.
CApplication& TheApp();

/// Waits so many milliseconds. What the person does meanwhile is collected in the message queue and
/// handled later.
void Sleep(int milliseconds);

}  // namespace platform
