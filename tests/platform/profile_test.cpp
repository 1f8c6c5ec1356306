// The profile store, also when its file is not what it should be, and when the program dies.

#include "platform/store/profile.h"

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <functional>
#include <limits>
#include <random>

#include "tests/support/temporary_folder.h"

namespace feltside::tests {
namespace {

namespace fs = std::filesystem;
using platform::CProfile;

class ProfileTest : public testing::Test {
 protected:
  bool WriteString(const std::string& section, const std::string& entry, const std::string& text) {
    return m_profile.UpdateStrings(section, {entry},
                                   [&text](const auto&) { return std::vector{text}; });
  }

  TemporaryFolder m_folder;
  const fs::path m_file = m_folder.Path() / "Maker" / "Program.toml";
  const CProfile m_profile{m_file};
};

TEST_F(ProfileTest, BringsIntegersBack) {
  EXPECT_EQ(m_profile.GetInt("S", "none", 7), 7);
  EXPECT_FALSE(fs::exists(m_file));  // reading makes no file
  for (const int value :
       {0, 1, -1, 39680, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()}) {
    EXPECT_TRUE(m_profile.WriteInt("S", "value", value));
    EXPECT_EQ(CProfile(m_file).GetInt("S", "value", 7), value);
    EXPECT_EQ(m_profile.GetString("S", "value", "absent"), "absent");
    EXPECT_EQ(m_profile.GetInt("T", "value", 7), 7);
  }
}

/// Any letters, many of them such as have a meaning in the file.
std::string AwkwardText(std::mt19937& random) {
  // clang-format off
  static constexpr std::array kPieces = {
      "\"", "\"\"\"", "'", "'''", "\\", "\\n", "\n", "\r\n", "\t", " ", "#", "=", "[", "]", "\b",
      "\x01", "\x7F", "\xC3\xA4", "\xE2\x99\xA0", "\xF0\x9F\x82\xA1", "A", "1979-05-27"};
  // clang-format on
  std::string text;
  for (auto left = random() % 12; left > 0; --left) text += kPieces[random() % kPieces.size()];
  if (random() % 8 == 0) text.push_back('\0');
  return text;
}

TEST_F(ProfileTest, BringsAwkwardStringsBack) {
  std::mt19937 random(4711);
  for (int i = 0; i < 2000; ++i) {
    const std::string text = AwkwardText(random);
    ASSERT_TRUE(WriteString("S", "text", text));
    ASSERT_EQ(m_profile.GetString("S", "text", "absent"), text) << testing::PrintToString(text);
  }
  EXPECT_TRUE(WriteString("A [b]", "c = \"d\"\n", "e"));  // names may be awkward too
  EXPECT_EQ(m_profile.GetString("A [b]", "c = \"d\"\n", ""), "e");
}

TEST_F(ProfileTest, KeepsWhatElseStandsInTheFile) {
  WriteFile(m_file, "[Other]\nname = \"x\"\nlist = [1, 2]\n[S]\nfirst = 1\n");
  EXPECT_TRUE(m_profile.WriteInt("S", "second", 2));
  EXPECT_EQ(m_profile.GetInt("S", "first", 0), 1);
  EXPECT_EQ(m_profile.GetString("Other", "name", ""), "x");
  EXPECT_NE(ReadFile(m_file).find("list = [ 1, 2 ]"), std::string::npos);
}

TEST_F(ProfileTest, TakesAValueOfAnotherTypeForNone) {
  for (const char* value : {"true", "1.0", "'1'", "[1]", "{a = 1}", "1979-05-27", "nan",
                            "2147483648", "-2147483649", "9223372036854775807"}) {
    WriteFile(m_file, std::string("[S]\nvalue = ") + value);
    EXPECT_EQ(m_profile.GetInt("S", "value", 7), 7) << value;
  }
  for (const char* value : {"1", "true", "['x']", "1979-05-27"}) {
    WriteFile(m_file, std::string("[S]\nvalue = ") + value);
    EXPECT_EQ(m_profile.GetString("S", "value", "absent"), "absent") << value;
  }
}

/// Files beside the profile that keep what it could not be understood.
std::vector<std::string> KeptCopies(const fs::path& file) {
  std::vector<std::string> texts;
  for (int i = 1; fs::exists(file.string() + ".damaged-" + std::to_string(i)); ++i) {
    texts.push_back(ReadFile(file.string() + ".damaged-" + std::to_string(i)));
  }
  return texts;
}

TEST_F(ProfileTest, SetsADamagedFileAside) {
  const std::vector<std::string> damaged = {"[S", "garbage", "\xFF\xFE\x01", "[S]\nx = 1\nx = 2",
                                            std::string("\0\0\0", 3)};
  for (std::size_t i = 0; i < damaged.size(); ++i) {
    WriteFile(m_file, damaged[i]);
    EXPECT_EQ(m_profile.GetInt("S", "x", 7), 7);
    ASSERT_EQ(KeptCopies(m_file).size(), i + 1);
    EXPECT_EQ(KeptCopies(m_file).back(), damaged[i]);
    EXPECT_TRUE(m_profile.WriteInt("S", "x", 3));
    EXPECT_EQ(m_profile.GetInt("S", "x", 7), 3);
  }
  EXPECT_EQ(KeptCopies(m_file).size(), damaged.size());
}

TEST_F(ProfileTest, KeepsACopyWhereSomethingElseThanASectionStood) {
  for (const std::string text : {"S = 3\n", "S = [1, 2]\n", "[[S]]\nx = 1\n"}) {
    WriteFile(m_file, text);
    EXPECT_EQ(m_profile.GetInt("S", "x", 7), 7);
    EXPECT_TRUE(m_profile.WriteInt("S", "x", 4)) << text;
    EXPECT_EQ(m_profile.GetInt("S", "x", 7), 4);
    EXPECT_EQ(KeptCopies(m_file).back(), text);
  }
}

TEST_F(ProfileTest, LivesWithAFileCutOffAnywhere) {
  m_profile.WriteInt("Settings", "TABLECOLOR", 39680);
  WriteString("Settings", "High0", "A \"name\" 120");
  const std::string whole = ReadFile(m_file);
  for (std::size_t length = 0; length < whole.size(); ++length) {
    const fs::path file = m_folder.Path() / std::to_string(length) / "p.toml";
    const CProfile profile(file);
    WriteFile(file, whole.substr(0, length));
    const std::string color = std::to_string(profile.GetInt("Settings", "TABLECOLOR", 39680));
    EXPECT_EQ(std::string("39680").rfind(color, 0), 0U) << length;
    const std::string name = profile.GetString("Settings", "High0", "absent");
    EXPECT_TRUE(name == "absent" || name == "A \"name\" 120") << length << ": " << name;
    EXPECT_TRUE(profile.WriteInt("Settings", "NUMDECKS", 2)) << length;
    EXPECT_EQ(profile.GetInt("Settings", "NUMDECKS", 7), 2) << length;
    for (const std::string& kept : KeptCopies(file)) EXPECT_EQ(kept, whole.substr(0, length));
  }
}

TEST_F(ProfileTest, LivesWithoutAPlaceToWrite) {
  fs::create_directories(m_file);  // where the file should be
  EXPECT_EQ(m_profile.GetInt("S", "x", 7), 7);
  EXPECT_FALSE(m_profile.WriteInt("S", "x", 3));
  EXPECT_TRUE(fs::is_directory(m_file));
  WriteFile(m_folder.Path() / "file", "no folder");
  const CProfile below(m_folder.Path() / "file" / "p.toml");
  EXPECT_EQ(below.GetInt("S", "x", 7), 7);
  EXPECT_FALSE(below.WriteInt("S", "x", 3));
  // The fresh file cannot be written: the old one stays as it was.
  const fs::path other = m_folder.Path() / "Other" / "p.toml";
  WriteFile(other, "[S]\nx = 5\n");
  fs::create_directories(other.string() + ".new");
  EXPECT_FALSE(CProfile(other).WriteInt("S", "x", 3));
  EXPECT_EQ(ReadFile(other), "[S]\nx = 5\n");
}

/// Runs a function in a process of its own.
pid_t InChild(const std::function<void()>& run) {
  const pid_t child = fork();
  if (child == 0) {
    run();
    _exit(0);
  }
  return child;
}

TEST_F(ProfileTest, LosesNothingWhenTwoProgramsWriteAtOnce) {
  constexpr int kWrites = 100;
  const auto write = [this](const std::string& name) {
    for (int i = 0; i < kWrites; ++i) m_profile.WriteInt("S", name + std::to_string(i), i);
  };
  const pid_t child = InChild([&] { write("child"); });
  write("parent");
  waitpid(child, nullptr, 0);
  for (int i = 0; i < kWrites; ++i) {
    EXPECT_EQ(m_profile.GetInt("S", "parent" + std::to_string(i), -1), i);
    EXPECT_EQ(m_profile.GetInt("S", "child" + std::to_string(i), -1), i);
  }
}

TEST_F(ProfileTest, IsTheOldOrTheNewOneWhenTheProgramIsKilled) {
  const std::string a(20000, 'a');
  const std::string b(20000, 'b');
  const auto write = [this](const std::string& text) {
    return m_profile.UpdateStrings("S", {"text", "twin"}, [&text](const auto&) {
      return std::vector{text, text};
    });
  };
  m_profile.WriteInt("S", "other", 5);
  write(a);
  std::mt19937 random(11);
  for (int i = 0; i < 200; ++i) {
    std::array<int, 2> beat{};
    ASSERT_EQ(pipe(beat.data()), 0);
    const pid_t child = InChild([&] {
      for (;;) {
        for (const std::string& text : {b, a}) {
          if (::write(beat[1], "x", 1) != 1) return;
          write(text);
        }
      }
    });
    char sign = 0;
    for (auto beats = 1 + random() % 4; beats > 0; --beats) {
      ASSERT_EQ(read(beat[0], &sign, 1), 1);
    }
    // Somewhere in the midst of a write.
    for (auto turns = random() % 200; turns > 0; --turns) sched_yield();
    kill(child, SIGKILL);
    waitpid(child, nullptr, 0);
    close(beat[0]);
    close(beat[1]);
    const std::string text = m_profile.GetString("S", "text", "absent");
    ASSERT_TRUE(text == a || text == b) << text.size();
    ASSERT_EQ(m_profile.GetString("S", "twin", ""), text);
    ASSERT_EQ(m_profile.GetInt("S", "other", 0), 5);
    ASSERT_TRUE(write(a));  // nobody holds the lock
  }
  EXPECT_TRUE(KeptCopies(m_file).empty());
}

}  // namespace
}  // namespace feltside::tests
