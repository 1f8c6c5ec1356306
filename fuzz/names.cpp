// Any list of high scores, any name and any result: the list takes what it should, in its place,
// and is the same at the next start.

#include <algorithm>

#include "fuzz/bytes.h"
#include "fuzz/session.h"
#include "platform/store/toml_text.h"
#include "shell/feltside_app.h"

namespace feltside::fuzz {
namespace {

using Entries = std::vector<std::string>;

constexpr std::size_t kPlaces = 5;

std::string Settings(const Entries& entries) {
  platform::CProfileSection list;
  for (std::size_t i = 0; i < entries.size(); ++i) list.Set("High" + std::to_string(i), entries[i]);
  return platform::ChangeSection("", "Settings", list).value().text;
}

Entries StoredIn(const std::string& text) {
  Entries entries;
  const auto section = platform::ReadSections(text).value()["Settings"];
  for (std::size_t i = 0; i < kPlaces; ++i) {
    entries.push_back(section.GetString("High" + std::to_string(i), ""));
  }
  return entries;
}

/// Valid UTF-8, as everything is that a file or a name holds.
std::string Valid(const std::string& text) {
  using Json = nlohmann::json;
  return Json::parse(Json(text).dump(-1, ' ', false, Json::error_handler_t::replace));
}

/// The control of that number, as an answer shows it.
nlohmann::json Control(const nlohmann::json& answer, int number) {
  if (!answer.contains("controls")) return nlohmann::json::object();
  for (const auto& control : answer["controls"]) {
    if (control["number"] == number) return control;
  }
  return nlohmann::json::object();
}

/// What the list must be once a result is entered; unchanged where it earns no place.
Entries Entered(Entries list, const std::string& name, int score) {
  if (list.size() == kPlaces && CFeltsideApp::ScoreOf(list.back()) >= score) return list;
  const auto below = std::find_if(list.begin(), list.end(), [score](const std::string& entry) {
    return CFeltsideApp::ScoreOf(entry) < score;
  });
  list.insert(below, name + " " + std::to_string(score));
  list.resize(std::min(list.size(), kPlaces));
  return list;
}

void Enter(Entries list, const std::string& typed, int score) {
  const CSession session(Settings(list));
  const auto answers = session.Play(
      {"wallet " + std::to_string(score), "command exit", "type " + typed, "press 1011"});
  const bool hadGap = std::find(list.begin(), list.end(), "") != list.end();
  list.erase(std::remove(list.begin(), list.end(), ""), list.end());
  const bool isOffered = answers[1]["windows"].size() == 2;
  const std::string name = isOffered ? Control(answers[2], 6016).value("text", std::string()) : "";
  Entries expected = isOffered && !name.empty() ? Entered(list, name, score) : list;
  Require(isOffered == (Entered(list, "x", score) != list), "is offered at the wrong time");
  const std::string stored = session.Settings();
  expected.resize(kPlaces);
  Entries actual = StoredIn(stored);
  // Where a gap was closed, what was the last stays there too.
  const auto length = expected.begin() - std::find(expected.begin(), expected.end(), "");
  actual.resize(static_cast<std::size_t>(-length));
  actual.resize(kPlaces);
  Require(actual == expected, "the list is another:\n" + stored);
  const auto again = session.Play({"command scores"});
  Require(hadGap || session.Settings() == stored, "the next start changes the list");
  if (expected[0].empty()) return;
  Require(Control(again[0], 6009)["text"] == expected[0], "shows another name");
}

}  // namespace
}  // namespace feltside::fuzz

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using namespace feltside::fuzz;
  CBytes bytes(data, size);
  const int score = bytes.Number(101, 2000);
  Entries list;
  for (int left = bytes.Number(0, 5); left > 0; --left) {
    const std::string name = Valid(bytes.Text());
    list.push_back(bytes.Number(0, 2) == 0 ? name
                                           : name + " " + std::to_string(bytes.Number(-9, 2000)));
  }
  std::string typed = bytes.Rest();
  std::replace(typed.begin(), typed.end(), '\n', ' ');
  Enter(list, typed, score);
  return 0;
}
