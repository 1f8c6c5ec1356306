// What each line of a script does.

#include "platform/dialog/combo_box.h"
#include "platform/dialog/slider.h"
#include "stylus/command_names.h"
#include "stylus/stylus.h"
#include "stylus/stylus_words.h"
#include "stylus/table_state.h"

namespace feltside {
namespace {

constexpr std::size_t kAnyNumber = static_cast<std::size_t>(-1);

void DismissPopups() {
  platform::CScreen& screen = platform::TheApp().Screen();
  while (screen.Top()->GetKind() == platform::CTopWindow::Kind::kPopup) {
    screen.Top()->OnPressOutside();
  }
}

}  // namespace

const std::vector<CStylus::Command>& CStylus::Commands() {
  // clang-format off
  static const std::vector<Command> commands = {
      {"tap", "X Y", "stylus down and up at a pixel of the table", 2, 2, &CStylus::Tap},
      {"touch", "X Y", "the same at a pixel of the whole window", 2, 2, &CStylus::Touch},
      {"down", "X Y", "stylus down at a pixel of the whole window", 2, 2, &CStylus::PointerDown},
      {"move", "X Y", "moves the stylus there", 2, 2, &CStylus::PointerMove},
      {"up", "X Y", "stylus up there", 2, 2, &CStylus::PointerUp},
      {"wheel", "X Y N", "turns the wheel there by N notches, up is positive", 3, 3, &CStylus::Wheel},
      {"command", "N", "chooses a command by name or number", 1, 1, &CStylus::ChooseCommand},
      {"key", "CHORD", "presses a key: H, Enter, Tab, Up, Alt+B, Ctrl+N, ...", 1, 1, &CStylus::PressKey},
      {"type", "TEXT", "types all that follows the blank", 0, kAnyNumber, &CStylus::Type},
      {"press", "N", "pushes the button, ticks the box or opens the list N of the topmost dialog", 1, 1, &CStylus::Press},
      {"select", "N K", "chooses item K, from 0, of its list N", 2, 2, &CStylus::Select},
      {"slide", "N V", "drags its slider N to the value V", 2, 2, &CStylus::Slide},
      {"clock", "YYYY-MM-DDTHH:MM:SS", "sets the local time", 1, 1, &CStylus::SetClock},
      {"stack", "C...", "puts cards next into the shoe: AS, TH or 10h, or 1 to 52", 1, kAnyNumber, &CStylus::Stack},
      {"wallet", "D", "sets the money to D dollars", 1, 1, &CStylus::SetWallet},
      {"shot", "FILE", "writes the whole window as PNG", 1, 1, &CStylus::Shot},
      {"words", "", "answers what was said last to whoever plays by ear", 0, 0, &CStylus::TellWords},
      {"state", "", "does nothing", 0, 0, &CStylus::ShowState},
      {"help", "", "lists these lines and the names of commands", 0, 0, &CStylus::Help},
      {"close", "", "pushes the window's close button", 0, 0, &CStylus::Close},
  };
  // clang-format on
  return commands;
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
  const int commandID = ToCommand(words[1]);
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
  for (std::size_t i = 1; i < words.size(); ++i) cards.push_back(ToCard(words[i]));
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

void CStylus::TellWords(const Words&) {
  m_bWithState = false;
  m_answer["words"] = m_host.Said();
}

void CStylus::Help(const Words&) {
  m_bWithState = false;
  for (const Command& command : Commands()) {
    const std::string words = command.words;
    m_answer["lines"][command.name + (words.empty() ? "" : " " + words)] = command.does;
  }
  for (const NamedCommand& command : kNamedCommands) {
    m_answer["commands"][command.name] = command.commandID;
  }
}

void CStylus::Close(const Words&) {
  platform::InputEvent event;
  event.kind = platform::InputKind::kClose;
  m_host.PutInput(event);
}

}  // namespace feltside
