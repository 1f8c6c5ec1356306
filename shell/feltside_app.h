#pragma once

#include <string>
#include <utility>
#include <vector>

#include "platform/window/application.h"

namespace feltside {

/// The program: starts it, ends it, and has the commands that belong to no window.
class CFeltsideApp : public platform::CApplication {
 public:
  CFeltsideApp();

  platform::CommandState QueryCommand(int commandID) const override;
  void RunCommand(int commandID) override;

  /// The best results so far, best first, at most five: each a name, a blank and the score in whole
  /// dollars.
  const std::vector<std::string>& HighScores() const { return m_arrHighScores; }
  /// The whole number behind an entry's last blank; 0 where no digits stand there, the nearest
  /// bound where it is beyond an int.
  static int ScoreOf(const std::string& entry);
  /// Enters a result below all that are as good, and stores it; the sixth of a list falls off.
  void AddHighScore(const std::string& name, int score);
  /// Whether a result earns a place.
  bool IsHighScore(int score) const;
  /// Takes over the list of another game that has kept a result since this one read it.
  void RefreshHighScores();

  /// Reads what is stored now, and returns the settings and high scores of it; they are good until
  /// the next call.
  const platform::CProfileSection& ReadSettings();
  /// Whether that could be read.
  bool HasReadSettings() const { return m_bReadSettings; }

 protected:
  bool InitInstance() override;
  int ExitInstance() override;
  /// Between deals only.
  bool CanShowNotice() const override;
  void ShowNotice(const std::string& trouble) override;

 private:
  struct Commands;

  void OnNew();
  void OnAbout();
  /// Takes them from what the view has read at its start.
  void LoadHighScores();
  void SaveHighScores();
  void InsertHighScore(const std::string& name, int score);
  void TakeOver(const std::vector<std::string>& stored);

  platform::CProfileSections m_mapStored;  ///< as last read
  bool m_bReadSettings = false;
  std::vector<std::string> m_arrHighScores;
  std::vector<std::string> m_arrLoadedScores;           ///< as they were last seen stored
  std::vector<std::pair<std::string, int>> m_arrAdded;  ///< and not stored yet
};

/// The one application object.
CFeltsideApp& TheFeltsideApp();

}  // namespace feltside
