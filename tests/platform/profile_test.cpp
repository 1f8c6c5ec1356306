// What the profile makes of its file, also when that is not what it should be.

#include <gmock/gmock.h>

#include <array>
#include <limits>
#include <random>
#include <thread>

#include "platform/store/toml_text.h"
#include "tests/platform/profile_helpers.h"

namespace feltside::tests {
namespace {

using testing::ElementsAre;

TEST_F(ProfileTest, BringsIntegersBack) {
  EXPECT_EQ(GetInt("none"), 7);
  EXPECT_FALSE(exists(m_file));  // reading makes no file
  for (const int value :
       {0, 1, -1, 39680, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()}) {
    EXPECT_TRUE(Store("value", value));
    EXPECT_EQ(GetInt("value"), value);
    EXPECT_EQ(GetString("value"), "absent");
    EXPECT_EQ(GetInt("value", "T"), 7);
  }
}

/// Any letters, many of them such as have a meaning in the file.
std::string AwkwardText(std::mt19937& random) {
  // clang-format off
  static constexpr std::array kPieces = {
      "\"", "\"\"\"", "'", "'''", "\\", "\\n", "\n", "\r\n", "\t", " ", "#", "=", "[", "]", "\b",
      "\x01", "\x7F", "\xC3\xA4", "\xE2\x99\xA0", "\xF0\x9F\x82\xA1", "A", "1979-05-27", "."};
  // clang-format on
  std::string text;
  for (auto left = random() % 12; left > 0; --left) text += kPieces[random() % kPieces.size()];
  if (random() % 8 == 0) text.push_back('\0');
  return text;
}

TEST(TomlText, BringsAwkwardNamesAndStringsBack) {
  std::mt19937 random(4711);
  for (int i = 0; i < 2000; ++i) {
    const std::string name = AwkwardText(random);
    const std::string text = AwkwardText(random);
    platform::CProfileSection change;
    change.Set(name, text);
    const auto changed = platform::ChangeSection("", name, change);
    ASSERT_TRUE(changed) << testing::PrintToString(name);
    ASSERT_EQ((*platform::ReadSections(changed->text))[name].GetString(name, "absent"), text)
        << testing::PrintToString(changed->text);
  }
}

TEST_F(ProfileTest, KeepsWhatElseStandsInTheFile) {
  WriteFile(m_file,
            "above = 1\n[[List]]\nx = 1\n[Other]\n\"O'Brien\" = [nan, -inf, 0.001, {a.b = 1}]\n"
            "when = 1979-05-27T07:32:00Z\n[Other.\"\xC3\xA9\"]\ne = {}\n[S]\nfirst = 1\n");
  EXPECT_TRUE(Store("second", 2));
  EXPECT_EQ(ReadFile(m_file),
            "List = [ { x = 1 } ]\nabove = 1\n[Other]\n"
            "\"O'Brien\" = [ nan, -inf, 0.001, { a = { b = 1 } } ]\nwhen = 1979-05-27T07:32:00Z\n"
            "\"\xC3\xA9\" = { e = {  } }\n[S]\nfirst = 1\nsecond = 2\n");
  EXPECT_THAT(KeptCopies(), ElementsAre());
}

TEST_F(ProfileTest, LosesNothingWhenTwoGamesWriteAtOnce) {
  constexpr int kWrites = 100;
  const auto write = [this](const std::string& name) {
    const auto profile = platform::OpenProfile(m_file);
    for (int i = 0; i < kWrites; ++i) {
      const auto change = [&](auto& section) { section.Set(name + std::to_string(i), i); };
      while (!profile->Update("S", change)) continue;  // the other one is too busy
    }
  };
  std::thread other(write, "other");
  write("this");
  other.join();
  for (int i = 0; i < kWrites; ++i) {
    EXPECT_EQ(GetInt("this" + std::to_string(i)), i);
    EXPECT_EQ(GetInt("other" + std::to_string(i)), i);
  }
}

TEST_F(ProfileTest, TakesAValueOfAnotherTypeForNone) {
  for (const char* value : {"true", "1.0", "'1'", "[1]", "{a = 1}", "1979-05-27", "nan",
                            "2147483648", "-2147483649", "9223372036854775807"}) {
    WriteFile(m_file, std::string("[S]\nvalue = ") + value);
    EXPECT_EQ(GetInt("value"), 7) << value;
  }
  for (const char* value : {"1", "true", "['x']", "1979-05-27"}) {
    WriteFile(m_file, std::string("[S]\nvalue = ") + value);
    EXPECT_EQ(GetString("value"), "absent") << value;
  }
}

std::string Repeated(const std::string& text, int times) {
  std::string all;
  for (; times > 0; --times) all += text;
  return all;
}

TEST_F(ProfileTest, SetsADamagedFileAside) {
  const std::vector<std::string> damaged = {
      "[S", "garbage", "\xFF\xFE\x01", "[S]\nx = 1\nx = 2", std::string("\0\0\0", 3),
      // Headers that begin with what begins no name.
      "[=", "[#", "[(", "[\\", "[[=", std::string("[\0", 2), "[S]\nx = {=1}",
      // A letter where none has a place, or where the parser looks for white space.
      "[\xC3\xA9]\n", "\xC3\xA9 = 1", "x = \xC3\xA9", "x = 1\xC3\xA9", "x = 1\"a.b=\xC3\xA9\"",
      "x = [\n1.\"\xC3\xA9\"]", "x = \"\"\"\\\n  \xC3\xA9\"\"\"", "x = \"\"\"\\\xC3\xA9\"\"\"",
      // So deep that a stack would not hold it, and so long that nobody has written it.
      "a" + Repeated(".a", 200000) + " = 1", "[a" + Repeated(" . \"a\"", 100000) + "]",
      "x = " + Repeated("[", 65) + Repeated("]", 65), "x = " + Repeated("{a = ", 100000),
      "[S]\nx = 5\n" + Repeated("# a comment\n", 100000)};
  for (std::size_t i = 0; i < damaged.size(); ++i) {
    WriteFile(m_file, damaged[i]);
    EXPECT_EQ(GetInt("x"), 7);
    ASSERT_EQ(KeptCopies().size(), i + 1) << damaged[i].substr(0, 99);
    EXPECT_EQ(KeptCopies().back(), damaged[i]);
    EXPECT_TRUE(Store("x", 3));
    EXPECT_EQ(GetInt("x"), 3);
  }
  EXPECT_EQ(KeptCopies().size(), damaged.size());
}

TEST_F(ProfileTest, ReadsLettersWhereTheyHaveTheirPlace) {
  for (const std::string& text : std::vector<std::string>{
           "\xEF\xBB\xBF# \xC3\xA9 'no string\n", "a = \"\xC3\xA9 \\\" \xC3\xA9\" # \xC3\xA9 \"\n",
           "'\xC3\xA9'.\"\xC3\xA9\" = '\xC3\xA9 \\'\n",
           "a = \"\"\"\"\"\xC3\xA9\\\n b \\\"\"\"\"\"\"\n", "a = '''\n'\xC3\xA9'\n'''''\n",
           "[\"\xC3\xA9\"]\n", "[a.'\xC3\xA9']\n[[b.'\xC3\xA9']]\n",
           "a = [1.5,\n['\xC3\xA9'], {'\xC3\xA9' = 1, b = '\xC3\xA9'}, # \xC3\xA9\n\"\"]\n",
           "a = [" + Repeated("1.5, ", 99) + "]\n"}) {
    WriteFile(m_file, text + "[S]\nx = 5\n");
    EXPECT_EQ(GetInt("x"), 5) << text;
  }
}

TEST_F(ProfileTest, KeepsOneCopyWhereSomethingElseStood) {
  std::size_t copies = 0;
  for (const std::string text : {"S = 3\n", "S = [1, 2]\n", "[[S]]\nx = 1\n", "[S]\nx = '1'\n",
                                 "[S]\nx = 1.5\ny = 'what else'\n"}) {
    WriteFile(m_file, text);
    EXPECT_EQ(GetInt("x"), 7);
    EXPECT_TRUE(Store("x", 4)) << text;
    EXPECT_EQ(GetInt("x"), 4);
    EXPECT_TRUE(Store("x", 5));
    ASSERT_EQ(KeptCopies().size(), ++copies) << text;
    EXPECT_EQ(KeptCopies().back(), text);
  }
}

TEST_F(ProfileTest, LivesWithAFileCutOffAnywhere) {
  EXPECT_TRUE(Store("TABLECOLOR", 39680));
  EXPECT_TRUE(Store("High0", "A \"name\" 120"));
  const std::string whole = ReadFile(m_file);
  for (std::size_t length = 0; length < whole.size(); ++length) {
    const std::size_t copies = KeptCopies().size();
    WriteFile(m_file, whole.substr(0, length));
    const std::string color =
        std::to_string((*m_pProfile->Read())["S"].GetInt("TABLECOLOR", 39680));
    EXPECT_EQ(std::string("39680").rfind(color, 0), 0U) << length;
    const std::string name = GetString("High0");
    EXPECT_TRUE(name == "absent" || name == "A \"name\" 120") << length << ": " << name;
    EXPECT_TRUE(Store("NUMDECKS", 2)) << length;
    EXPECT_EQ(GetInt("NUMDECKS"), 2) << length;
    if (KeptCopies().size() > copies) {
      EXPECT_EQ(KeptCopies().back(), whole.substr(0, length));
    }
  }
}

}  // namespace
}  // namespace feltside::tests
