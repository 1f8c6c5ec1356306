#include "shell/feltside_app.h"

#include <array>
#include <memory>

#include "platform/dialog/message_box.h"
#include "platform/window/document_template.h"
#include "shell/about_dlg.h"
#include "shell/feltside_doc.h"
#include "shell/main_frame.h"
#include "shell/res/frame_resources.h"
#include "shell/res/pictures.h"
#include "shell/settings.h"
#include "shell/window_memory.h"
#include "table/command_ids.h"
#include "table/feltside_view.h"

namespace feltside {

struct CFeltsideApp::Commands {
  using App = CFeltsideApp;
  /// There is no file to open on this system: to open is to start with a new document.
  static constexpr std::array<platform::CommandEntry<App>, 3> kMap = {{
      {platform::kCommandNew, &App::OnNew},
      {platform::kCommandOpen, &App::OnNew},
      {platform::kCommandAbout, &App::OnAbout},
  }};
};

CFeltsideApp& TheFeltsideApp() { return static_cast<CFeltsideApp&>(platform::TheApp()); }

CFeltsideApp::CFeltsideApp() : CApplication("Feltside", PictureFiles(), kWindowSize) {}

platform::CommandState CFeltsideApp::QueryCommand(int commandID) const {
  return QueryCommandMap(*this, Commands::kMap, commandID);
}

void CFeltsideApp::RunCommand(int commandID) { RunCommandMap(*this, Commands::kMap, commandID); }

bool CFeltsideApp::InitInstance() {
  SetRegistryKey("Quillworks");
  platform::CSingleDocTemplate::Makers makers;
  makers.document = [] { return std::make_unique<CFeltsideDoc>(); };
  makers.frame = [](const std::string& title) { return std::make_unique<CMainFrame>(title); };
  makers.view = [](platform::CFrameWindow& frame) {
    return std::make_unique<CFeltsideView>(frame);
  };
  AddDocTemplate(std::make_unique<platform::CSingleDocTemplate>(kDocumentString, makers));
  if (!OpenNewDocument()) return false;
  RestoreWindowPlace(m_mapStored[kWindowSection]);
  ShowMainWindow(IDR_MAINFRAME);
  LoadHighScores();
  return true;
}

int CFeltsideApp::ExitInstance() {
  SaveHighScores();
  StoreWindowPlace(m_mapStored[kWindowSection]);
  return CApplication::ExitInstance();
}

const platform::CProfileSection& CFeltsideApp::ReadSettings() {
  auto stored = Profile().Read();
  m_bReadSettings = stored.has_value();
  m_mapStored = std::move(stored).value_or(platform::CProfileSections());
  return m_mapStored[kSettingsSection];
}

bool CFeltsideApp::CanShowNotice() const {
  // The deal can be asked for exactly while none is played.
  return MainFrame()->View().QueryCommand(kCommandDeal) == platform::CommandState::kEnabled;
}

void CFeltsideApp::ShowNotice(const std::string& trouble) { platform::MessageBox(trouble); }

void CFeltsideApp::OnNew() { OpenNewDocument(); }

void CFeltsideApp::OnAbout() { CAboutDlg().DoModal(); }

}  // namespace feltside
