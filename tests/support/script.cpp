#include "tests/support/script.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <map>
#include <memory>
#include <sstream>
#include <vector>

#include "stylus/stylus_words.h"
#include "tests/support/table_line.h"

namespace feltside::tests {
namespace {

/// The words of a script for what can be pushed or tapped on the table.
// clang-format off
const std::map<std::string, std::string> kWords = {
    {"deal", "command deal"},   {"hit", "command hit"},       {"stand", "command stand"},
    {"split", "command split"}, {"double", "command double"}, {"insure", "tap 56 190"},
    {"decline", "tap 130 190"}, {"raise", "tap 110 160"},     {"lower", "tap 90 160"},
    {"advise", "tap 180 118"},  {"draw", "tap 100 200"},      {"1", "tap 54 130"},
    {"2", "tap 87 130"},        {"3", "tap 120 130"},         {"4", "tap 153 130"},
    {"5", "tap 186 130"}};
// clang-format on

/// A member by its path, such as "m_layout.m_crTable", "controls.1007.text" or "enabled.deal".
Json Find(const Json& state, const std::string& path) {
  const Json* at = &state;
  const auto enabled = state.find("enabled");
  for (const std::string& name : SplitAt(".", path)) {
    const auto isWanted = [&name](const Json& c) {
      return std::to_string(c["number"].get<int>()) == name;
    };
    const bool isCommand = enabled != state.end() && at == &*enabled;
    const auto found = at->is_array() ? std::find_if(at->begin(), at->end(), isWanted)
                       : isCommand    ? at->find(std::to_string(ToCommand(name)))
                                      : at->find(name);
    if (found == at->end()) return "there is no " + path;
    at = &*found;
  }
  return *at;
}

/// One script while it is played.
class Player {
 public:
  void Play(const std::string& line) {
    const std::string head = line.substr(0, line.find(' '));
    const std::string rest = head.size() < line.size() ? line.substr(head.size() + 1) : "";
    if (head == "==") {
      m_pStylus.reset();
      m_profile.clear();
    } else if (head == "settings") {
      SetSettings(rest);
    } else if (head == "restart") {
      Give("close", "gone");
      m_profile = ReadFile(m_pStylus->ProfileFile());
      m_pStylus.reset();
    } else if (head == "kept") {
      ExpectKept(rest);
    } else if (head == "says") {
      EXPECT_EQ(Program().Send("words")["words"], rest);
    } else if (head == "look") {
      m_looks[rest] = Program().Shot();
    } else if (head != "--") {
      const auto parts = SplitAt(" => ", line);
      Do(parts[0], parts.size() > 1 ? parts[1] : "");
    }
  }

 private:
  Stylus& Program() {
    if (m_pStylus == nullptr) {
      m_pStylus = std::make_unique<Stylus>(m_profile);
      m_before = m_pStylus->Send("state");
    }
    return *m_pStylus;
  }

  void SetSettings(const std::string& settings) {
    std::string text = "[Settings]\n";
    for (const std::string& setting : SplitAt("; ", settings)) text += setting + "\n";
    m_profile = text;
    if (m_pStylus != nullptr) WriteFile(m_pStylus->ProfileFile(), text);
  }

  void ExpectKept(const std::string& settings) {
    const std::string file = ReadFile(Program().ProfileFile());
    if (settings == "nothing") {
      EXPECT_EQ(file, m_profile);
      return;
    }
    for (const std::string& setting : SplitAt("; ", settings)) {
      EXPECT_NE(("\n" + file).find("\n" + setting + "\n"), std::string::npos) << setting << "\n"
                                                                              << file;
    }
  }

  void Do(const std::string& line, const std::string& expectations) {
    const std::string head = line.substr(0, line.find(' '));
    const std::string rest = line.substr(std::min(head.size() + 1, line.size()));
    const auto word = kWords.find(head);
    if (head == "keys") {
      GiveKeys(SplitAt(" ", rest), expectations);
    } else if (word == kWords.end()) {
      Give(line, expectations);
    } else {
      if (!rest.empty()) Give("stack " + rest, "");
      Give(word->second, expectations);
    }
  }

  void GiveKeys(const std::vector<std::string>& keys, const std::string& expectations) {
    for (std::size_t i = 0; i < keys.size(); ++i) {
      const bool typed = keys[i][0] == '\'';
      Give(typed ? "type " + keys[i].substr(1) : "key " + keys[i],
           i + 1 < keys.size() ? "" : expectations);
    }
  }

  void Give(const std::string& command, const std::string& expectations) {
    Json answer = Program().Send(command);
    const bool error = answer.contains("error");
    const bool refused = answer.contains("refused");
    if (error) {
      answer = Program().Send("state");
      EXPECT_EQ(Missing(answer, m_before), "");
    }
    bool mayFail = false;
    for (const std::string& expected : SplitAt("; ", expectations)) {
      if (expected == "error" || expected == "refused") {
        mayFail = true;
        EXPECT_TRUE(expected == "error" ? error : refused) << command;
      } else {
        Expect(answer, expected);
      }
    }
    EXPECT_TRUE(mayFail || !(error || refused)) << command;
    answer.erase("refused");
    m_before = answer;
  }

  void Expect(const Json& answer, const std::string& expected) {
    if (expected.empty()) return;
    if (expected.find('|') != std::string::npos) {
      EXPECT_EQ(TableLine(answer), expected);
    } else if (expected == "gone") {
      EXPECT_EQ(Missing(answer, {{"running", false}, {"exit", 0}}), "");
    } else if (expected.rfind("looks ", 0) == 0) {
      EXPECT_EQ(Program().Shot(), m_looks.at(expected.substr(6)));
    } else {
      const std::string path = expected.substr(0, expected.find(' '));
      EXPECT_EQ(Find(answer, path), ReadJson(expected.substr(path.size()))) << path;
    }
  }

  std::string m_profile;
  std::unique_ptr<Stylus> m_pStylus;
  std::map<std::string, platform::CBitmap> m_looks;
  Json m_before = Json::object();  ///< the state after the last command
};

}  // namespace

std::vector<std::string> ScriptNames() {
  std::vector<std::string> names;
  for (const auto& entry : std::filesystem::directory_iterator(FELTSIDE_SCRIPTS_FOLDER)) {
    if (entry.path().extension() == ".txt") names.push_back(entry.path().stem().string());
  }
  std::sort(names.begin(), names.end());
  return names;
}

void PlayScript(const std::string& name) {
  const std::string file = std::string(FELTSIDE_SCRIPTS_FOLDER) + "/" + name + ".txt";
  std::ifstream stream(file);
  ASSERT_TRUE(stream) << file;
  Player player;
  int number = 0;
  for (std::string line; std::getline(stream, line);) {
    SCOPED_TRACE(testing::Message() << file << ":" << ++number << ": " << line);
    if (line.empty() || line[0] == ';') continue;
    player.Play(line);
    if (testing::Test::HasFatalFailure()) return;
  }
}

std::vector<std::string> SplitAt(const std::string& separator, std::string text) {
  std::vector<std::string> parts;
  for (std::size_t end = 0; end != std::string::npos;) {
    end = text.find(separator);
    parts.push_back(text.substr(0, end));
    if (end != std::string::npos) text.erase(0, end + separator.size());
  }
  return parts;
}

Json Do(Stylus& stylus, const std::string& command) {
  Json answer = stylus.Send(command);
  EXPECT_FALSE(answer.contains("error") || answer.contains("refused")) << command << answer;
  return answer;
}

std::string Missing(const Json& actual, const Json& expected) {
  std::string text;
  for (const auto& [name, value] : expected.items()) {
    if (!actual.contains(name)) {
      text += name + " is missing\n";
    } else if (value.is_object()) {
      text += Missing(actual[name], value);
    } else if (actual[name] != value) {
      text += name + " is " + ToText(actual[name]) + ", not " + ToText(value) + "\n";
    }
  }
  return text;
}

}  // namespace feltside::tests
