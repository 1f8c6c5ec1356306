// The five best results: loaded at the start, stored when one is added and at the end.

#include <algorithm>
#include <cstdlib>
#include <limits>

#include "shell/feltside_app.h"
#include "shell/settings.h"

namespace feltside {
namespace {

/// By place; as many as the list has.
const std::vector<std::string> kEntryNames = {"High0", "High1", "High2", "High3", "High4"};

/// Empty strings are no entries.
std::vector<std::string> EntriesOf(const platform::CProfileSection& stored) {
  std::vector<std::string> entries;
  for (const std::string& name : kEntryNames) {
    if (const std::string entry = stored.GetString(name, ""); !entry.empty()) {
      entries.push_back(entry);
    }
  }
  return entries;
}

}  // namespace

void CFeltsideApp::LoadHighScores() {
  m_arrHighScores = m_arrLoadedScores = EntriesOf(m_mapStored[kSettingsSection]);
}

void CFeltsideApp::RefreshHighScores() { TakeOver(EntriesOf(ReadSettings())); }

/// Another game has kept a result since: that list is the one to go on with.
void CFeltsideApp::TakeOver(const std::vector<std::string>& stored) {
  if (stored.empty() || stored == m_arrLoadedScores) return;
  m_arrHighScores = m_arrLoadedScores = stored;
  for (const auto& [name, score] : m_arrAdded) InsertHighScore(name, score);
}

void CFeltsideApp::SaveHighScores() {
  if (m_arrHighScores.empty()) return;
  std::vector<std::string> written;
  const bool stored = Profile().Update(kSettingsSection, [&](platform::CProfileSection& settings) {
    TakeOver(EntriesOf(settings));
    for (std::size_t place = 0; place < m_arrHighScores.size(); ++place) {
      settings.Set(kEntryNames[place], m_arrHighScores[place]);
    }
    written = EntriesOf(settings);
  });
  if (!stored) return;
  m_arrLoadedScores = written;
  m_arrAdded.clear();
}

int CFeltsideApp::ScoreOf(const std::string& entry) {
  const std::size_t blank = entry.rfind(' ');
  const std::string score = blank == std::string::npos ? entry : entry.substr(blank + 1);
  const long long value = std::strtoll(score.c_str(), nullptr, 10);
  return static_cast<int>(std::clamp<long long>(value, std::numeric_limits<int>::min(),
                                                std::numeric_limits<int>::max()));
}

void CFeltsideApp::AddHighScore(const std::string& name, int score) {
  m_arrAdded.emplace_back(name, score);
  InsertHighScore(name, score);
  SaveHighScores();
}

void CFeltsideApp::InsertHighScore(const std::string& name, int score) {
  const auto lower =
      std::find_if(m_arrHighScores.begin(), m_arrHighScores.end(),
                   [score](const std::string& entry) { return ScoreOf(entry) < score; });
  m_arrHighScores.insert(lower, name + " " + std::to_string(score));
  if (m_arrHighScores.size() > kEntryNames.size()) m_arrHighScores.pop_back();
}

bool CFeltsideApp::IsHighScore(int score) const {
  return m_arrHighScores.size() < kEntryNames.size() || score > ScoreOf(m_arrHighScores.back());
}

}  // namespace feltside
