// The five best results: loaded at the start, kept at the end.

#include <algorithm>
#include <cstdlib>
#include <limits>

#include "shell/feltside_app.h"
#include "shell/settings.h"

namespace feltside {
namespace {

/// By place; as many as the list has.
const std::vector<std::string> kEntryNames = {"High0", "High1", "High2", "High3", "High4"};

/// What a list holds besides empty strings, which are no entries.
std::vector<std::string> EntriesOf(std::vector<std::string> strings) {
  strings.erase(std::remove(strings.begin(), strings.end(), ""), strings.end());
  return strings;
}

}  // namespace

void CFeltsideApp::LoadHighScores() {
  std::vector<std::string> strings;
  strings.reserve(kEntryNames.size());
  for (const std::string& name : kEntryNames) {
    strings.push_back(Profile().GetString(kSettingsSection, name, ""));
  }
  m_arrHighScores = m_arrLoadedScores = EntriesOf(strings);
}

void CFeltsideApp::SaveHighScores() {
  if (m_arrHighScores.empty()) return;
  Profile().UpdateStrings(kSettingsSection, kEntryNames, [this](const auto& strings) {
    // Another game has kept a result since this one started: that list is the one to go on with.
    const auto stored = EntriesOf(strings);
    if (!stored.empty() && stored != m_arrLoadedScores) {
      m_arrHighScores = stored;
      for (const auto& [name, score] : m_arrAdded) InsertHighScore(name, score);
    }
    return m_arrHighScores;
  });
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
  if (m_arrHighScores.size() > kEntryNames.size()) m_arrHighScores.pop_back();
}

bool CFeltsideApp::IsHighScore(int score) const {
  return m_arrHighScores.size() < kEntryNames.size() || score > ScoreOf(m_arrHighScores.back());
}

}  // namespace feltside
