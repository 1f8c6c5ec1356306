#pragma once

#include <istream>
#include <nlohmann/json.hpp>
#include <ostream>
#include <string>
#include <vector>

#include "platform/dialog/dialog.h"
#include "platform/host/offscreen_host.h"
#include "shell/feltside_app.h"
#include "table/feltside_view.h"

namespace feltside {

/// Plays the program by commands: reads one a line, does what a person with a stylus would, and
/// answers each with a line of JSON once the program is idle again.
class CStylus {
 public:
  /// All four must outlive it.
  CStylus(platform::OffscreenHost& host, CFeltsideApp& app, std::istream& in, std::ostream& out);

  /// Runs the program to its end, answers the last command and returns the exit code.
  int Run();

 private:
  using Json = nlohmann::ordered_json;
  using Words = std::vector<std::string>;
  /// A command's name, what may follow it, what it does and how many words may follow; `run` is
  /// given the whole line and then each of them, and throws a CommandError that says what is wrong.
  struct Command {
    const char* name;
    const char* words;
    const char* does;
    std::size_t fewest;
    std::size_t most;
    void (CStylus::*run)(const Words& words);
  };
  static const std::vector<Command>& Commands();

  static CFeltsideView& View();
  /// The topmost dialog or message box; null while none is open.
  static platform::CDialog* TopDialog();

  bool OnIdle();
  void Answer(const Json& answer);
  void Interpret(const std::string& line);
  Json State();
  Json EnabledCommands() const;

  void Tap(const Words& words);
  void Touch(const Words& words);
  void PointerDown(const Words& words);
  void PointerMove(const Words& words);
  void PointerUp(const Words& words);
  void Wheel(const Words& words);
  void ChooseCommand(const Words& words);
  void PressKey(const Words& words);
  void Type(const Words& words);
  void SetClock(const Words& words);
  void Stack(const Words& words);
  void SetWallet(const Words& words);
  void Shot(const Words& words);
  void TellWords(const Words&);
  void ShowState(const Words&) {}
  void Help(const Words&);
  void Close(const Words& words);
  void Press(const Words& words);
  void Select(const Words& words);
  void Slide(const Words& words);
  void PutPointer(platform::InputKind kind, platform::Point at);
  void PutTap(platform::Point at);
  /// A control of the topmost dialog that can be worked with; throws where there is none of that
  /// number.
  static platform::CControl& LiveControl(const std::string& word);

  platform::OffscreenHost& m_host;
  CFeltsideApp& m_app;
  std::istream& m_in;
  std::ostream& m_out;
  bool m_bAnswerDue = false;
  Json m_answer;  ///< what the due answer holds besides the state
  bool m_bWithState = true;
};

}  // namespace feltside
