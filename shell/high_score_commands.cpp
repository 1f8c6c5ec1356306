// The view's commands that have to do with the high scores: showing them, and leaving the table.

#include "platform/window/application.h"
#include "shell/feltside_app.h"
#include "shell/high_scores_dlg.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {
/// What every run starts with; only more than that is worth entering.
constexpr double kStartMoney = 100.0;
}  // namespace

bool CFeltsideView::CanShowHighScores() const { return !TheFeltsideApp().HighScores().empty(); }

void CFeltsideView::OnHighScores() { CHighScoresDlg().DoModal(); }

void CFeltsideView::OnExit() {
  const int score = WholeDollars(m_dWallet);
  const bool isOffered = m_dWallet > kStartMoney && m_bUseHighScores != 0;
  if (isOffered) TheFeltsideApp().RefreshHighScores();
  if (isOffered && TheFeltsideApp().IsHighScore(score)) {
    CHighScoresDlg dialog;
    dialog.m_nScore = score;
    dialog.m_bNewHighScore = 1;
    dialog.DoModal();
  }
  platform::TheApp().Queue().PostQuit(0);
}

}  // namespace feltside
