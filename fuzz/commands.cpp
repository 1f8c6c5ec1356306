// Any commands in the order of a grammar, at the table and in the dialogs: a second bookkeeping
// holds throughout.

#include <iostream>

#include "fuzz/bytes.h"
#include "fuzz/session.h"
#include "tests/play/table_model.h"

namespace feltside::fuzz {
namespace {

using Lines = std::vector<std::string>;

constexpr std::size_t kMostLines = 400;

std::string Place(CBytes& bytes) {
  return std::to_string(bytes.Number(-3, 252)) + " " + std::to_string(bytes.Number(-3, 300));
}

std::string Stack(CBytes& bytes) {
  std::string line = "stack";
  for (int left = bytes.Number(1, 16); left > 0; --left) {
    line +=
        " " + std::to_string(bytes.Number(0, 9) == 0 ? bytes.Number(-1, 60) : bytes.Number(1, 52));
  }
  return line;
}

std::string Chord(CBytes& bytes) {
  static const Lines kModifiers = {"", "", "", "", "Shift+", "Ctrl+", "Alt+", "Ctrl+Shift+"};
  static const Lines kKeys = {
      "Enter", "Escape",   "Tab",       "Up",     "Down", "Left", "Right", "Home", "End", "PageUp",
      "Space", "PageDown", "Backspace", "Delete", "F1",   "F4",   "F10",   "H",    "S",   "D",
      "P",     "N",        "I",         "B",      "A",    "C",    "V",     "X",    "Q",   "O",
      "1",     "3",        "5",         "+",      "-",    "G",    "Hit",   "Z",    ""};
  return "key " + bytes.OneOf(kModifiers) + bytes.OneOf(kKeys);
}

std::string OnControl(CBytes& bytes) {
  static const Lines kControls = {"1",    "2",    "6",    "7",    "1000", "1005", "1007",
                                  "1008", "1009", "1010", "1011", "1012", "1013", "1014",
                                  "1500", "1502", "6000", "6001", "6002", "6006", "6016"};
  const std::string control = bytes.OneOf(kControls);
  switch (bytes.Number(0, 3)) {
    case 0:
      return "select " + control + " " + std::to_string(bytes.Number(-1, 13));
    case 1:
      return "slide " + control + " " + std::to_string(bytes.Number(-1, 256));
    default:
      return "press " + control;
  }
}

/// A line of no kind at all; but none that writes a file wherever it says.
std::string AnyLine(CBytes& bytes) {
  std::string line = bytes.Text();
  for (char& letter : line) letter = letter == '\n' || letter == '#' ? ' ' : letter;
  return line.find("shot") == std::string::npos && line.find("wallet") == std::string::npos ? line
                                                                                            : "";
}

std::string NextLine(CBytes& bytes) {
  static const Lines kCommands = {"deal",       "hit",         "stand",  "double", "split",
                                  "game-setup", "table-setup", "scores", "about",  "help",
                                  "new",        "open",        "exit"};
  static const Lines kTargets = {"90 160",  "110 160", "60 195", "190 195", "180 118", "100 200",
                                 "120 185", "54 130",  "87 130", "120 130", "153 130", "186 130"};
  static const Lines kPointer = {"down ", "move ", "up ", "touch ", "tap "};
  switch (bytes.Number(0, 14)) {
    case 0:
      return bytes.OneOf(kPointer) + Place(bytes);
    case 1:
      return "wheel " + Place(bytes) + " " + std::to_string(bytes.Number(-3, 3));
    case 2:
      return "type " + bytes.Text();
    case 3:
      return "wallet " + std::to_string(bytes.Number(-5000, 5000) / 2.0);
    case 4:
      return AnyLine(bytes);
    case 5:
      return "clock 2026-0" + std::to_string(bytes.Number(0, 9)) + "-28T23:59:58";
    case 6:
    case 7:
      return Stack(bytes);
    case 8:
      return Chord(bytes);
    case 9:
    case 10:
      return OnControl(bytes);
    case 11:
      return "tap " + bytes.OneOf(kTargets);
    case 12:
      return "close";
    default:
      return "command " + bytes.OneOf(kCommands);
  }
}

std::string Settings(CBytes& bytes) {
  std::string text = "[Settings]\n";
  for (const char* name : {"GAME_TYPE", "STRATTYPE", "NUMDECKS", "PLAYSPEED", "FANCYVP", "FANCYBJ",
                           "VIDEODISCARDS", "USEHIGH"}) {
    text += std::string(name) + " = " + std::to_string(bytes.Number(-1, 6)) + "\n";
  }
  return text + "High0 = 'Ann 500'\n";
}

void Play(const std::string& settings, const Lines& lines) {
  const CSession session(settings);
  Lines watched = {"state"};
  for (const std::string& line : lines) {
    watched.push_back(line);
    watched.emplace_back("state");
  }
  const auto answers = session.Play(watched);
  tests::TableModel model(answers[0]);
  for (std::size_t i = 1; i < answers.size(); ++i) {
    if (answers[i].contains("error")) continue;
    const std::string wrong = model.Next(watched[i], answers[i]);
    if (wrong.empty()) continue;
    for (std::size_t line = 1; line <= i; line += 2) std::cerr << watched[line] << '\n';
    Require(false, settings + wrong);
  }
}

}  // namespace
}  // namespace feltside::fuzz

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using namespace feltside::fuzz;
  CBytes bytes(data, size);
  const std::string settings = Settings(bytes);
  Lines lines;
  while (!bytes.AtEnd() && lines.size() < kMostLines) {
    std::string line = NextLine(bytes);
    for (char& letter : line) letter = letter == '\n' ? ' ' : letter;
    if (!line.empty()) lines.push_back(line);
  }
  Play(settings, lines);
  return 0;
}
