#include "tests/support/script.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <memory>
#include <sstream>
#include <vector>

#include "tests/support/table_line.h"

namespace feltside::tests {
namespace {

using Words = std::map<std::string, std::string>;

// clang-format off
const Words kCommands = {
    {"game-setup", "command 32779"}, {"table-setup", "command 32777"}, {"scores", "command 32781"},
    {"about", "command 57664"},      {"help", "command 32778"},        {"exit", "command 57665"}};
const Words kButtons = {
    {"deal", "command 32776"},  {"hit", "command 32771"},    {"stand", "command 32772"},
    {"split", "command 32773"}, {"double", "command 32775"}, {"insure", "tap 56 190"},
    {"decline", "tap 130 190"}, {"raise", "tap 110 160"},    {"lower", "tap 90 160"},
    {"advise", "tap 180 118"},  {"draw", "tap 100 200"},     {"1", "tap 54 130"},
    {"2", "tap 87 130"},        {"3", "tap 120 130"},        {"4", "tap 153 130"},
    {"5", "tap 186 130"}};
const Words kKeys = {
    {"deal", "key Space"}, {"hit", "key H"},    {"stand", "key S"},    {"split", "key P"},
    {"double", "key D"},   {"insure", "key I"}, {"decline", "key N"},  {"raise", "key +"},
    {"lower", "key -"},    {"advise", "key B"}, {"draw", "key Enter"}, {"1", "key 1"},
    {"2", "key 2"},        {"3", "key 3"},      {"4", "key 4"},        {"5", "key 5"}};
// clang-format on

std::vector<std::string> SplitAt(const std::string& separator, std::string text) {
  std::vector<std::string> parts;
  for (std::size_t end = 0; end != std::string::npos;) {
    end = text.find(separator);
    parts.push_back(text.substr(0, end));
    if (end != std::string::npos) text.erase(0, end + separator.size());
  }
  return parts;
}

/// A member by its path, such as "m_layout.m_crTable" or "controls.1007.text".
Json Find(const Json& state, const std::string& path) {
  const Json* at = &state;
  for (const std::string& name : SplitAt(".", path)) {
    const auto isWanted = [&name](const Json& c) {
      return std::to_string(c["number"].get<int>()) == name;
    };
    const auto found =
        at->is_array() ? std::find_if(at->begin(), at->end(), isWanted) : at->find(name);
    if (found == at->end()) return "there is no " + path;
    at = &*found;
  }
  return *at;
}

/// One script while it is played.
class Player {
 public:
  explicit Player(Door door) : m_door(door) {}

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
    } else if (head != "--") {
      const auto parts = SplitAt(" => ", line);
      const std::string expected = parts.size() > 1 ? parts[1] : "";
      if (head == "keys") {
        GiveKeys(SplitAt(" ", parts[0].substr(5)), expected);
      } else {
        Give(parts[0], expected);
      }
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

  std::string CommandOf(const std::string& words) const {
    if (words.rfind("cards ", 0) == 0) return StackOf(words.substr(6));
    for (const Words* known : {&kCommands, m_door == Door::kKeys ? &kKeys : &kButtons}) {
      if (const auto found = known->find(words); found != known->end()) return found->second;
    }
    return words;
  }

  void GiveKeys(const std::vector<std::string>& keys, const std::string& expectations) {
    for (std::size_t i = 0; i < keys.size(); ++i) {
      const bool typed = keys[i][0] == '\'';
      Give(typed ? "type " + keys[i].substr(1) : "key " + keys[i],
           i + 1 < keys.size() ? "" : expectations);
    }
  }

  void Give(const std::string& words, const std::string& expectations) {
    const std::string command = CommandOf(words);
    Json answer = Program().Send(command);
    const bool error = answer.contains("error");
    // A key that means nothing now is not refused: it does nothing.
    const bool idleKey = command.rfind("key ", 0) == 0 && Missing(answer, m_before).empty();
    const bool refused = answer.contains("refused") || idleKey;
    if (error) {
      answer = Program().Send("state");
      EXPECT_EQ(Missing(answer, m_before), "");
    }
    bool mayFail = false;
    for (const std::string& expected : SplitAt("; ", expectations)) {
      if (expected == "error" || expected == "refused") {
        mayFail = true;
        EXPECT_TRUE(expected == "error" ? error : refused) << words;
      } else {
        Expect(answer, expected);
      }
    }
    EXPECT_TRUE(mayFail || !(error || answer.contains("refused"))) << words;
    answer.erase("refused");
    m_before = answer;
  }

  static void Expect(const Json& answer, const std::string& expected) {
    if (expected.empty()) return;
    if (expected.find('|') != std::string::npos) {
      EXPECT_EQ(TableLine(answer), expected);
    } else if (expected == "gone") {
      EXPECT_EQ(Missing(answer, {{"running", false}, {"exit", 0}}), "");
    } else {
      const std::string path = expected.substr(0, expected.find(' '));
      EXPECT_EQ(Find(answer, path), Json::parse(expected.substr(path.size()))) << path;
    }
  }

  Door m_door;
  std::string m_profile;
  std::unique_ptr<Stylus> m_pStylus;
  Json m_before;  ///< the state after the last command
};

}  // namespace

void PlayScript(const std::string& name, Door door) {
  const std::string file = std::string(FELTSIDE_SCRIPTS_FOLDER) + "/" + name + ".txt";
  std::ifstream stream(file);
  ASSERT_TRUE(stream) << file;
  Player player(door);
  int number = 0;
  for (std::string line; std::getline(stream, line);) {
    SCOPED_TRACE(testing::Message() << file << ":" << ++number << ": " << line);
    if (line.empty() || line[0] == ';') continue;
    player.Play(line);
    if (testing::Test::HasFatalFailure()) return;
  }
}

std::string StackOf(const std::string& cards) {
  const std::string ranks = "A23456789TJQK";
  const std::string suits = "CDHS";
  std::string command = "stack";
  std::istringstream words(cards);
  for (std::string word; words >> word;) {
    const std::size_t suit = word.size() > 1 ? suits.find(word[1]) : 0;
    command += " " + std::to_string(suit * ranks.size() + ranks.find(word[0]) + 1);
  }
  return command;
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
      text += name + " is " + actual[name].dump() + ", not " + value.dump() + "\n";
    }
  }
  return text;
}

}  // namespace feltside::tests
