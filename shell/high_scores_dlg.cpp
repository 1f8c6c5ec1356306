#include "shell/high_scores_dlg.h"

#include "platform/dialog/message_box.h"
#include "shell/feltside_app.h"
#include "shell/res/dialog_templates.h"

namespace feltside {

CHighScoresDlg::CHighScoresDlg() : CDialog(HighScoresTemplate()) {}

bool CHighScoresDlg::OnInitDialog() {
  CDialog::OnInitDialog();
  RefreshList();
  ShowEntry(m_bNewHighScore != 0);
  return true;
}

void CHighScoresDlg::RefreshList() {
  int line = kScoresFirstLine;
  for (const std::string& entry : TheFeltsideApp().HighScores()) {
    GetDlgItem(line++)->SetText(entry);
  }
}

void CHighScoresDlg::ShowEntry(bool visible) {
  for (const int controlID : {kScoresName, kScoresNameLabel, kScoresMessage, kScoresAdd}) {
    GetDlgItem(controlID)->ShowWindow(visible);
  }
}

bool CHighScoresDlg::IsEntryOpen() const { return GetDlgItem(kScoresAdd)->IsVisible(); }

void CHighScoresDlg::OnButton(int controlID) {
  if (controlID == kScoresAdd) OnAdd();
}

void CHighScoresDlg::OnAdd() {
  platform::CControl& edit = *GetDlgItem(kScoresName);
  if (edit.GetText().empty()) {
    SetFocus(&edit);
    return;
  }
  TheFeltsideApp().AddHighScore(edit.GetText(), m_nScore);
  ShowEntry(false);
  SetFocus(GetDlgItem(platform::kResultOk));
  RefreshList();
}

void CHighScoresDlg::OnOK() {
  if (!IsEntryOpen()) return CDialog::OnOK();
  const bool empty = GetDlgItem(kScoresName)->GetText().empty();
  if (empty &&
      platform::MessageBox("Skip entering high score?", platform::MessageBoxButtons::kYesNo) ==
          platform::MessageBoxResult::kYes) {
    return CDialog::OnOK();
  }
  // With a name it is entered; without one it only gets the keyboard back.
  OnAdd();
}

}  // namespace feltside
