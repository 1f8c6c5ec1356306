#include "platform/window/application.h"

#include <algorithm>
#include <cstdlib>
#include <utility>

#include "platform/host/host.h"
#include "platform/window/document_template.h"
#include "platform/window/frame_window.h"

namespace platform {
namespace {
CApplication* g_pApplication = nullptr;
}  // namespace

CApplication& TheApp() {
  if (g_pApplication == nullptr) std::abort();
  return *g_pApplication;
}

void Sleep(int milliseconds) { TheApp().Queue().Pause(milliseconds); }

CApplication::CApplication(std::string name, EmbeddedFiles resources, Size windowSize)
    : m_strName(std::move(name)), m_resources(resources), m_screen(windowSize) {
  g_pApplication = this;
}

CApplication::~CApplication() {
  m_pDocTemplate.reset();
  g_pApplication = nullptr;
}

int CApplication::Main() {
  if (!InitInstance()) return EXIT_FAILURE;
  RunUntil([] { return false; });
  const int exitCode = ExitInstance();
  TakeTroubles();
  m_bQuit = false;  // the boxes of the last notices run
  while (HasNotice()) ShowNextNotice();
  return exitCode;
}

void CApplication::RunUntil(const std::function<bool()>& done) {
  Message message;
  while (!m_bQuit && !done()) {
    if (!m_queue.Peek(message)) {
      OnIdle();
      if (!m_bQuit) m_queue.Wait(m_screen.TimeToTip());
    } else if (message.kind == MessageKind::kQuit) {
      m_bQuit = true;
      m_nExitCode = message.exitCode;
    } else {
      Dispatch(message);
    }
  }
}

void CApplication::Dispatch(const Message& message) {
  switch (message.kind) {
    case MessageKind::kInput:
      m_screen.HandleInput(message.input);
      break;
    case MessageKind::kCommand:
      if (m_pMainFrame != nullptr) m_pMainFrame->ExecuteCommand(message.commandID);
      break;
    case MessageKind::kClose:
      m_queue.PostQuit(0);
      break;
    case MessageKind::kQuit:
      break;
  }
}

void CApplication::OnIdle() {
  Refresh();
  TakeTroubles();
  if (m_pMainFrame == nullptr) return;  // not before there is a table to be told at
  while (HasNotice() && !m_bQuit && !m_bShowingNotice && CanShowNotice()) {
    ShowNextNotice();
    Refresh();
  }
  if (m_screen.Top() != nullptr) m_narrator.TellOf(*m_screen.Top());
}

void CApplication::TakeTroubles() {
  if (m_pProfile == nullptr) return;
  // The same one comes again only where something could be stored in between.
  for (std::string& trouble : m_pProfile->TakeTroubles()) {
    m_arrNotices.push_back(std::move(trouble));
  }
}

void CApplication::ShowNextNotice() {
  m_bShowingNotice = true;
  ShowNotice(m_arrNotices[m_nShownNotices++]);
  m_bShowingNotice = false;
}

void CApplication::Notify(const std::string& trouble) {
  if (std::find(m_arrNotices.begin(), m_arrNotices.end(), trouble) == m_arrNotices.end()) {
    m_arrNotices.push_back(trouble);
  }
}

void CApplication::ShowHelp(const std::string& commandLine) {
  Refresh();  // the start may take a moment, in which no closed menu is to stay in sight
  const std::string trouble = TheHost().StartHelpViewer(commandLine);
  if (!trouble.empty()) Notify(trouble);
}

void CApplication::Refresh() {
  if (m_pMainFrame != nullptr) m_pMainFrame->RefreshCommandStates();
  m_screen.PaintAll();
  m_screen.Present();
}

void CApplication::SetRegistryKey(const std::string& key) {
  const std::filesystem::path folder = TheHost().ProfileFolder();
  m_pProfile = OpenProfile(folder.empty() ? folder : folder / key / (m_strName + ".toml"));
}

void CApplication::AddDocTemplate(std::unique_ptr<CSingleDocTemplate> docTemplate) {
  m_pDocTemplate = std::move(docTemplate);
}

void CApplication::ShowMainWindow(int iconID) {
  m_pMainFrame = m_pDocTemplate->Frame();
  // Desktops scale the icon to their own sizes; a larger one would only cost memory.
  constexpr int kWindowIconWidth = 48;
  TheHost().SetIdentity(m_pMainFrame->GetTitle(),
                        m_resources.LoadIconOfSize(iconID, kWindowIconWidth));
  m_pMainFrame->Open();
  Refresh();
}

bool CApplication::OpenNewDocument() { return m_pDocTemplate->OpenNewDocument(); }

}  // namespace platform
