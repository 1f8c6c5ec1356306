// The five best results: loaded at the start, kept at the end.

#include <algorithm>
#include <cstdlib>
#include <limits>

#include "shell/feltside_app.h"
#include "shell/settings.h"

namespace feltside {
namespace {

constexpr std::size_t kMostEntries = 5;

std::string EntryName(std::size_t place) { return "High" + std::to_string(place); }

}  // namespace

std::vector<std::string> CFeltsideApp::StoredHighScores() const {
  std::vector<std::string> entries;
  for (std::size_t place = 0; place < kMostEntries; ++place) {
    const std::string entry = Profile().GetString(kSettingsSection, EntryName(place), "");
    if (!entry.empty()) entries.push_back(entry);
  }
  return entries;
}

void CFeltsideApp::LoadHighScores() { m_arrHighScores = m_arrLoadedScores = StoredHighScores(); }

void CFeltsideApp::SaveHighScores() {
  // Another game has kept a result since this one started: that list is the one to go on with.
  const auto stored = StoredHighScores();
  if (!stored.empty() && stored != m_arrLoadedScores) {
    m_arrHighScores = stored;
    for (const auto& [name, score] : m_arrAdded) InsertHighScore(name, score);
  }
  for (std::size_t place = 0; place < m_arrHighScores.size(); ++place) {
    Profile().WriteString(kSettingsSection, EntryName(place), m_arrHighScores[place]);
  }
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
}

void CFeltsideApp::InsertHighScore(const std::string& name, int score) {
  const auto lower =
      std::find_if(m_arrHighScores.begin(), m_arrHighScores.end(),
                   [score](const std::string& entry) { return ScoreOf(entry) < score; });
  m_arrHighScores.insert(lower, name + " " + std::to_string(score));
  if (m_arrHighScores.size() > kMostEntries) m_arrHighScores.pop_back();
}

bool CFeltsideApp::IsHighScore(int score) const {
  return m_arrHighScores.size() < kMostEntries || score > ScoreOf(m_arrHighScores.back());
}

}  // namespace feltside
