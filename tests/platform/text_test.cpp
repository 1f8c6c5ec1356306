// Text: how letters stand beside each other, what fits where, and what is left when memory is
// short.

#include "platform/draw/text.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <random>
#include <set>

#include "platform/draw/font_finder.h"
#include "platform/draw/look.h"
#include "platform/draw/utf8.h"
#include "platform/draw/wrapped_text.h"
#include "tests/platform/failing_machine.h"
#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

namespace fs = std::filesystem;
using namespace platform;

std::vector<Font> AllFonts() {
  std::vector<Font> fonts;
  for (const int height : {11, 13, 14, 15, 22}) {
    fonts.push_back({height, false});
    fonts.push_back({height, true});
  }
  return fonts;
}

// The first of this program to draw texts of these fonts, which the game does not use.
TEST(Text, IsWholeAgainAfterMemoryWasShort) {
  for (const Font& font : {Font{15, false}, Font{22, true}}) {
    g_bRefusesOnce = font.bold;
    int tries = 0;
    for (bool refused = true; refused && tries < 1000; ++tries) {
      g_nBeforeRefusal = tries;
      EXPECT_EQ(RenderText(font, "V").GetSize().height, font.height);
      refused = std::exchange(g_nBeforeRefusal, -1) <= 0;
    }
    EXPECT_GT(tries, 45);  // in so many pieces, at least, a face and a glyph are read
  }
  CBitmap lines({230, 170}, kWhite);
  CSurface surface(lines);
  int top = 0;
  for (const Font& each : AllFonts()) {
    surface.DrawStencil({1, top}, RenderText(each, "Vast Kings joy: $104.17"), kBlack);
    EXPECT_EQ(MeasureText(each, ""), (Size{0, each.height}));
    top += each.height + 2;
  }
  ExpectGolden(lines, "text_faces");
}

TEST(Text, TakesFromASecondFaceOnlyWhatTheFirstLacks) {
  static std::u32string asked;
  const auto find = [](char32_t character) {
    asked += character;
    return FontFile{character == U'\uF004' ? FELTSIDE_SECOND_FACE : "/no/such/face", 0};
  };
  const CBitmap box = RenderText({13}, "\u05D0");
  SetFontFinder(find);
  const CBitmap letter = RenderText({13}, "\uF004");
  EXPECT_EQ(RenderText({13}, "\uF006"), box);
  EXPECT_NE(RenderText({13}, "a\u00E9\uF004"), RenderText({13}, "a\u00E9\uF006"));
  SetFontFinder(nullptr);
  EXPECT_NE(letter, box);
  EXPECT_EQ(asked, U"\uF004\uF006");
}

/// The texts in the sources of the game, and amounts of all kinds.
std::set<std::string> TextsOfTheGame() {
  std::set<std::string> texts;
  const auto isSmall = [](char c) { return c >= 'a' && c <= 'z'; };
  for (const char* folder : {"engine", "render", "table", "shell", "platform/dialog"}) {
    for (const auto& entry :
         fs::recursive_directory_iterator(FELTSIDE_SOURCES / fs::path(folder))) {
      // What is only spoken is never drawn.
      if (entry.path().extension() == ".png" || entry.path().stem() == "words") continue;
      std::ifstream file(entry.path());
      std::string part;
      for (bool quoted = false; std::getline(file, part, '"'); quoted = !quoted) {
        const bool isText = std::any_of(part.begin(), part.end(), isSmall) &&
                            part.find_first_of("#/\\\n") == std::string::npos;
        if (quoted && isText) texts.insert(WithoutMnemonic(part));
      }
    }
  }
  for (int i = 0; i < 100; ++i) {
    const std::string amount = std::to_string(i) + "." + std::to_string(99 - i);
    texts.insert({"$" + amount, "$-" + amount});
  }
  return texts;
}

/// The ink of each letter where it stands in the text.
std::vector<std::vector<Point>> InkOf(const Font& font, const std::string& text) {
  std::vector<std::vector<Point>> letters;
  CBitmap before;
  for (std::size_t end = 1; end <= text.size(); ++end) {
    const CBitmap now = RenderText(font, text.substr(0, end));
    letters.emplace_back();
    for (int x = 0; x < now.GetSize().width; ++x) {
      for (int y = 0; y < font.height; ++y) {
        const bool known = before.Bounds().Contains({x, y}) && IsOpaque(before.At({x, y}));
        if (IsOpaque(now.At({x, y})) && !known) letters.back().push_back({x, y});
      }
    }
    before = now;
  }
  return letters;
}

bool Touch(const std::vector<Point>& first, const std::vector<Point>& second) {
  return std::any_of(first.begin(), first.end(), [&](Point a) {
    return std::any_of(second.begin(), second.end(), [a](Point b) {
      return std::abs(a.x - b.x) <= 1 && std::abs(a.y - b.y) <= 1;
    });
  });
}

TEST(Text, KeepsTheLettersOfTheGameApart) {
  // No column is clear between these, but nothing touches:
  const std::string overhangs =
      "Ta Tr Tw Ty Ve Wa Ye Yo "  // an arm reaches over a small letter
      "at av ay "                 // a tail runs out below a letter that stands free there
      "kj kJ "                    // a leg runs out above a hook
      "-1 -2 -3 -7 14 17 41 47 "  // there is room beside a stroke, a foot, a slope
      "-v (+ -) r) ";             // or beside a bow
  const std::set<std::string> texts = TextsOfTheGame();
  EXPECT_GT(texts.size(), 250U);
  const std::vector<Font> used = {{11}, {11, true}, {13}, {13, true}, {14, true}, {15, true}, {22}};
  for (const Font& font : used) {
    for (const std::string& text : texts) {
      const auto letters = InkOf(font, text);
      for (std::size_t i = 1; i < letters.size(); ++i) {
        const auto& [first, second] = std::tie(letters[i - 1], letters[i]);
        if (first.empty() || second.empty()) continue;
        const bool apart = second.front().x - first.back().x > 1 ||
                           overhangs.find(text.substr(i - 1, 2) + " ") != std::string::npos;
        EXPECT_TRUE(apart && !Touch(first, second))
            << text << " at " << i << ", " << font.height << (font.bold ? " bold" : "");
      }
    }
  }
}

TEST(Text, FitsAsManyLettersAsThereIsRoomFor) {
  const std::vector<std::string> pieces = {"A",      "V",      "T",      "j",          "a",
                                           "t",      "1",      ".",      " ",          "\u0301",
                                           "\u05E9", "\u05BC", "\u2026", "\U0001F600", "\xFF"};
  std::mt19937 random(12);
  for (int round = 0; round < 200; ++round) {
    std::string text;
    for (auto left = random() % 20; left > 0; --left) text += pieces[random() % pieces.size()];
    const int room = static_cast<int>(random() % 120);
    for (const Font& font : AllFonts()) {
      const std::size_t fitting = FittingLength(font, text, room);
      EXPECT_LE(MeasureText(font, text.substr(0, fitting)).width, room) << text;
      if (fitting < text.size()) {
        const std::string longer = text.substr(0, NextLetter(text, fitting));
        EXPECT_GT(MeasureText(font, longer).width, room) << text;
      }
      EXPECT_EQ(RenderText(font, text).GetSize(), MeasureText(font, text)) << text;
    }
    // The ellipsis alone takes a dozen.
    EXPECT_LE(MeasureText(kSystemFont, Ellipsized(text, 12 + room)).width, 12 + room) << text;
  }
}

}  // namespace
}  // namespace feltside::tests
