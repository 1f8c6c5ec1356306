#include "stylus/stylus.h"

#include <array>
#include <sstream>

#include "platform/dialog/combo_box.h"
#include "platform/dialog/slider.h"
#include "stylus/stylus_words.h"
#include "stylus/table_state.h"
#include "table/command_ids.h"

namespace feltside {
namespace {

constexpr std::size_t kAnyNumber = static_cast<std::size_t>(-1);

constexpr std::array kShownCommands = {
    kCommandHit,        kCommandStand,         kCommandDoubleDown,
    kCommandSplit,      kCommandDeal,          kCommandGameSetup,
    kCommandTableSetup, kCommandHighScores,    platform::kCommandAbout,
    kCommandHelp,       platform::kCommandExit};

CFeltsideView& View() {
  return static_cast<CFeltsideView&>(platform::TheApp().MainFrame()->View());
}

/// The topmost dialog or message box; null while none is open.
platform::CDialog* TopDialog() {
  const auto& windows = platform::TheApp().Screen().Windows();
  for (auto window = windows.rbegin(); window != windows.rend(); ++window) {
    if (auto* dialog = dynamic_cast<platform::CDialog*>(*window)) return dialog;
  }
  return nullptr;
}

void DismissPopups() {
  platform::CScreen& screen = platform::TheApp().Screen();
  while (screen.Top()->GetKind() == platform::CTopWindow::Kind::kPopup) {
    screen.Top()->OnPressOutside();
  }
}

nlohmann::ordered_json ToJson(const platform::CControl& control) {
  const platform::Rect place = control.GetClientRect().Moved(control.ScreenOrigin());
  return {{"number", control.GetID()},
          {"kind", control.KindName()},
          {"text", control.GetText()},
          {"value", control.GetValue()},
          {"visible", control.IsVisible()},
          {"enabled", control.IsEnabled()},
          {"rect", {place.left, place.top, place.right, place.bottom}}};
}

/// The number of the control that has the keyboard; 0 for none.
int FocusOf(const platform::CDialog& dialog) {
  const auto* control = static_cast<const platform::CControl*>(dialog.GetFocus());
  return control == nullptr ? 0 : control->GetID();
}

}  // namespace

const std::vector<CStylus::Command>& CStylus::Commands() {
  static const std::vector<Command> commands = {
      {"tap", 2, 2, &CStylus::Tap},
      {"touch", 2, 2, &CStylus::Touch},
      {"down", 2, 2, &CStylus::PointerDown},
      {"move", 2, 2, &CStylus::PointerMove},
      {"up", 2, 2, &CStylus::PointerUp},
      {"wheel", 3, 3, &CStylus::Wheel},
      {"command", 1, 1, &CStylus::ChooseCommand},
      {"key", 1, 1, &CStylus::PressKey},
      {"type", 0, kAnyNumber, &CStylus::Type},
      {"press", 1, 1, &CStylus::Press},
      {"select", 2, 2, &CStylus::Select},
      {"slide", 2, 2, &CStylus::Slide},
      {"clock", 1, 1, &CStylus::SetClock},
      {"stack", 1, kAnyNumber, &CStylus::Stack},
      {"wallet", 1, 1, &CStylus::SetWallet},
      {"shot", 1, 1, &CStylus::Shot},
      {"state", 0, 0, &CStylus::ShowState},
      {"close", 0, 0, &CStylus::Close},
  };
  return commands;
}

CStylus::CStylus(platform::OffscreenHost& host, CFeltsideApp& app, std::istream& in,
                 std::ostream& out)
    : m_host(host), m_app(app), m_in(in), m_out(out) {
  m_host.SetIdleHandler([this] { return OnIdle(); });
}

int CStylus::Run() {
  const int exitCode = m_app.Main();
  if (m_bAnswerDue) {
    Json state = State();
    state["running"] = false;
    state["exit"] = exitCode;
    Answer(state);
  }
  return exitCode;
}

bool CStylus::OnIdle() {
  if (m_bAnswerDue) {
    m_bAnswerDue = false;
    Json answer = m_bWithState ? State() : Json::object();
    answer.update(m_answer);
    Answer(answer);
  }
  std::string line;
  do {
    if (!std::getline(m_in, line)) return false;
  } while (line.empty() || line[0] == '#');
  Interpret(line);
  return true;
}

/// One line, at once. Bytes of a malformed command that are not UTF-8 are shown as replaced.
void CStylus::Answer(const Json& answer) {
  m_out << answer.dump(-1, ' ', false, Json::error_handler_t::replace) << std::endl;
}

void CStylus::Interpret(const std::string& line) {
  m_bAnswerDue = true;
  m_bWithState = true;
  m_answer = Json::object();
  std::istringstream stream(line);
  Words words;
  for (std::string word; stream >> word;) words.push_back(word);
  try {
    for (const Command& command : Commands()) {
      if (words.empty() || words[0] != command.name) continue;
      const std::size_t following = words.size() - 1;
      if (following < command.fewest || following > command.most) {
        throw CommandError{"wrong number of words: " + line};
      }
      // A text is taken as it stands, blanks and all.
      words[0] = line;
      return (this->*command.run)(words);
    }
    throw CommandError{"unknown command: " + line};
  } catch (const CommandError& error) {
    m_bWithState = false;
    m_answer["error"] = error.what;
  }
}

CStylus::Json CStylus::State() {
  Json state = CTableState(View()).Read();
  state["enabled"] = EnabledCommands();
  state["windows"] = Json::array();
  for (const platform::CTopWindow* window : m_app.Screen().Windows()) {
    state["windows"].push_back(window->GetTitle());
  }
  state["controls"] = Json::array();
  if (const platform::CDialog* dialog = TopDialog()) {
    for (const auto& control : dialog->Controls()) state["controls"].push_back(ToJson(*control));
    state["focus"] = FocusOf(*dialog);
  }
  state["typing"] = m_host.TextPlace().has_value();
  state["tip"] = m_app.Screen().TipText();
  state["helps"] = m_host.HelpCalls();
  state["running"] = true;
  return state;
}

CStylus::Json CStylus::EnabledCommands() const {
  Json enabled = Json::object();
  for (const int commandID : kShownCommands) {
    enabled[std::to_string(commandID)] = m_app.MainFrame()->IsCommandEnabled(commandID);
  }
  return enabled;
}

void CStylus::PutPointer(platform::InputKind kind, platform::Point at) {
  platform::InputEvent event;
  event.kind = kind;
  event.at = at;
  m_host.PutInput(event);
}

void CStylus::PutTap(platform::Point at) {
  PutPointer(platform::InputKind::kPointerDown, at);
  PutPointer(platform::InputKind::kPointerUp, at);
}

void CStylus::Tap(const Words& words) {
  const platform::Point p = ToPoint(words);
  if (View().GetClientRect().Contains(p)) PutTap(p + View().ScreenOrigin());
}

void CStylus::Touch(const Words& words) {
  const platform::Point p = ToPoint(words);
  if (RectAt({}, m_app.Screen().GetSize()).Contains(p)) PutTap(p);
}

void CStylus::PointerDown(const Words& words) {
  PutPointer(platform::InputKind::kPointerDown, ToPoint(words));
}

void CStylus::PointerMove(const Words& words) {
  PutPointer(platform::InputKind::kPointerMove, ToPoint(words));
}

void CStylus::PointerUp(const Words& words) {
  PutPointer(platform::InputKind::kPointerUp, ToPoint(words));
}

void CStylus::Wheel(const Words& words) {
  platform::InputEvent event;
  event.kind = platform::InputKind::kWheel;
  event.at = ToPoint(words);
  event.wheel = ToInt(words[3]);
  m_host.PutInput(event);
}

void CStylus::ChooseCommand(const Words& words) {
  const int commandID = ToInt(words[1]);
  if (m_app.MainFrame()->IsCommandEnabled(commandID)) {
    DismissPopups();
    m_app.Queue().PostCommand(commandID);
  } else {
    m_answer["refused"] = true;
  }
}

void CStylus::PressKey(const Words& words) {
  const auto stroke = platform::ParseChord(words[1]);
  if (!stroke) throw CommandError{"no such key: " + words[1]};
  platform::InputEvent event;
  event.kind = platform::InputKind::kKey;
  event.stroke = *stroke;
  m_host.PutInput(event);
}

void CStylus::Type(const Words& words) {
  // The text begins one blank behind the name and may consist of blanks.
  const std::size_t start = words[0].find("type") + std::string("type ").size();
  if (words[0].size() <= start) throw CommandError{"nothing to type"};
  platform::InputEvent event;
  event.kind = platform::InputKind::kText;
  event.text = words[0].substr(start);
  m_host.PutInput(event);
}

platform::CControl& CStylus::LiveControl(const std::string& word) {
  const int controlID = ToInt(word);
  const platform::CDialog* dialog = TopDialog();
  platform::CControl* control = dialog == nullptr ? nullptr : dialog->GetDlgItem(controlID);
  if (control == nullptr || !control->IsVisible() || !control->IsEnabled()) {
    throw CommandError{"no such control: " + word};
  }
  return *control;
}

void CStylus::Press(const Words& words) {
  const platform::CControl& control = LiveControl(words[1]);
  const std::string kind = control.KindName();
  if (kind != "button" && kind != "check" && kind != "list") {
    throw CommandError{"not to be pressed: " + words[1]};
  }
  DismissPopups();
  const platform::Rect place = control.GetClientRect();
  PutTap(control.ScreenOrigin() + platform::Point{place.right / 2, place.bottom / 2});
}

void CStylus::Select(const Words& words) {
  const int item = ToInt(words[2]);
  auto* list = dynamic_cast<platform::CComboBox*>(&LiveControl(words[1]));
  if (list == nullptr) throw CommandError{"no list: " + words[1]};
  if (item < 0 || item >= list->GetItemCount()) throw CommandError{"no such item: " + words[2]};
  DismissPopups();
  list->Choose(item);
}

void CStylus::Slide(const Words& words) {
  const int value = ToInt(words[2]);
  auto* slider = dynamic_cast<platform::CSlider*>(&LiveControl(words[1]));
  if (slider == nullptr) throw CommandError{"no slider: " + words[1]};
  if (value < slider->GetLowest() || value > slider->GetHighest()) {
    throw CommandError{"beyond the slider's range: " + words[2]};
  }
  slider->MoveTo(value);
}

void CStylus::SetClock(const Words& words) { m_host.SetClock(ToTime(words[1])); }

void CStylus::Stack(const Words& words) {
  std::vector<int> cards;
  for (std::size_t i = 1; i < words.size(); ++i) cards.push_back(ToInt(words[i]));
  const std::string wrong = CTableState(View()).Stack(cards);
  if (!wrong.empty()) throw CommandError{wrong};
}

void CStylus::SetWallet(const Words& words) {
  CTableState(View()).SetWallet(ToMoney(words[1]));
  View().Invalidate();
}

void CStylus::Shot(const Words& words) {
  m_bWithState = false;
  if (!platform::SavePng(m_host.Shown(), words[1])) {
    throw CommandError{"cannot write " + words[1]};
  }
}

void CStylus::Close(const Words&) {
  platform::InputEvent event;
  event.kind = platform::InputKind::kClose;
  m_host.PutInput(event);
}

}  // namespace feltside
