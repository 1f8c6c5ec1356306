#include "bench/game.h"

#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <sstream>
#include <stdexcept>

#include "stylus/stylus_words.h"

namespace feltside::bench {
namespace {

std::filesystem::path NewFolder(const std::string& settings) {
  auto folder =
      std::filesystem::temp_directory_path() / ("feltside-bench-" + std::to_string(getpid()));
  std::filesystem::create_directories(folder / "Quillworks");
  std::ofstream(folder / "Quillworks" / "Feltside.toml") << "[Settings]\n" << settings;
  return folder;
}

}  // namespace

CGame::CGame(const std::string& settings, std::vector<std::string> lines)
    : OffscreenHost(NewFolder(settings)), m_lines(std::move(lines)) {
  platform::SetHost(this);
}

CGame::~CGame() {
  platform::SetHost(nullptr);
  std::filesystem::remove_all(ProfileFolder());
}

void CGame::Run(const std::function<void()>& measure) {
  SetIdleHandler([&] {
    if (m_nGiven == m_lines.size()) {
      measure();
      return false;
    }
    Give(m_lines[m_nGiven++]);
    return true;
  });
  CFeltsideApp().Main();
}

CFeltsideView& CGame::View() {
  return static_cast<CFeltsideView&>(platform::TheApp().MainFrame()->View());
}

void CGame::Do(int commandID) {
  platform::TheApp().Dispatch({platform::MessageKind::kCommand, {}, commandID, 0});
}

void CGame::Give(const std::string& line) {
  std::istringstream stream(line);
  std::string head;
  std::string word;
  stream >> head;
  std::vector<int> cards;
  while (stream >> word) {
    platform::InputEvent key;
    key.kind = platform::InputKind::kKey;
    if (head == "stack") {
      cards.push_back(ToCard(word));
    } else if (head == "command") {
      platform::TheApp().Queue().PostCommand(ToCommand(word));
    } else if (head == "key") {
      key.stroke = platform::ParseChord(word).value();
      PutInput(key);
    } else {
      throw std::invalid_argument("no such line here: " + line);
    }
  }
  if (head == "stack") CTableState(View()).Stack(cards);
}

}  // namespace feltside::bench
