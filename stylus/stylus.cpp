#include "stylus/stylus.h"

#include <sstream>

#include "stylus/command_names.h"
#include "stylus/stylus_words.h"
#include "stylus/table_state.h"

namespace feltside {
namespace {

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

CStylus::CStylus(platform::OffscreenHost& host, CFeltsideApp& app, std::istream& in,
                 std::ostream& out)
    : m_host(host), m_app(app), m_in(in), m_out(out) {
  m_in.exceptions(std::ios::badbit);  // a line that memory does not suffice for is not the end
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

CFeltsideView& CStylus::View() {
  return static_cast<CFeltsideView&>(platform::TheApp().MainFrame()->View());
}

platform::CDialog* CStylus::TopDialog() {
  const auto& windows = platform::TheApp().Screen().Windows();
  for (auto window = windows.rbegin(); window != windows.rend(); ++window) {
    if (auto* dialog = dynamic_cast<platform::CDialog*>(*window)) return dialog;
  }
  return nullptr;
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
  for (const auto& [name, commandID, shown] : kNamedCommands) {
    if (shown) enabled[std::to_string(commandID)] = m_app.MainFrame()->IsCommandEnabled(commandID);
  }
  return enabled;
}

}  // namespace feltside
