#include "tests/shell/dialog_desk.h"

#include <fcntl.h>
#include <unistd.h>

#include <condition_variable>
#include <cstdio>
#include <functional>
#include <mutex>
#include <optional>
#include <sstream>
#include <thread>
#include <utility>

#include "platform/frame_window.h"
#include "shell/table_state.h"

namespace feltside::tests {
namespace {

using platform::Point;

CFeltsideView& View() {
  return static_cast<CFeltsideView&>(platform::TheApp().MainFrame()->View());
}

/// The thread in which the programs run, one after another. There is one for all, as SDL keeps some
/// memory for every thread that it has worked in; it stays until the process ends.
class ProgramThread {
 public:
  static ProgramThread& The() {
    static auto* const thread = new ProgramThread;
    return *thread;
  }

  // For the test; they return at the program's next Yield, or at its end.
  void Start(std::function<void()> program) {
    m_program = std::move(program);
    Resume();
  }
  void Resume() { GiveTurn(true); }
  /// For the program; returns when it is resumed.
  void Yield() { GiveTurn(false); }

 private:
  ProgramThread() {
    std::thread([this] {
      std::unique_lock lock(m_mutex);
      m_turnChanged.wait(lock, [this] { return m_bProgramsTurn; });
      lock.unlock();
      for (;; Yield()) m_program();
    }).detach();
  }

  void GiveTurn(bool toProgram) {
    std::unique_lock lock(m_mutex);
    m_bProgramsTurn = toProgram;
    m_turnChanged.notify_all();
    m_turnChanged.wait(lock, [this, toProgram] { return m_bProgramsTurn != toProgram; });
  }

  std::mutex m_mutex;
  std::condition_variable m_turnChanged;
  bool m_bProgramsTurn = false;
  std::function<void()> m_program;
};

/// What a WriteWatch has seen; nothing while there is none.
std::optional<std::vector<std::string>> g_writes;

}  // namespace

DialogDesk::DialogDesk(const std::string& profile) {
  if (!profile.empty()) {
    WriteFile(m_host.ProfileFolder() / "Quillworks" / "Feltside.toml", profile);
  }
  m_host.SetIdleHandler([this] {
    ProgramThread::The().Yield();
    return !m_bLeaving;
  });
  ProgramThread::The().Start([this] {
    CFeltsideApp().Main();
    m_bRunning = false;
  });
}

DialogDesk::~DialogDesk() {
  m_bLeaving = true;
  if (m_bRunning) ProgramThread::The().Resume();
}

Json DialogDesk::Table() const { return Json::parse(CTableState(View()).Read().dump()); }

void DialogDesk::Command(int commandID) {
  platform::TheApp().Queue().PostCommand(commandID);
  ProgramThread::The().Resume();
}

void DialogDesk::Pointer(platform::InputKind kind, Point at) {
  m_host.PutPointer(kind, at);
  ProgramThread::The().Resume();
}

void DialogDesk::Tap(Point at) {
  Press(at);
  Release(at);
}

void DialogDesk::Wheel(Point at, int notches) {
  platform::InputEvent event;
  event.kind = platform::InputKind::kWheel;
  event.at = at;
  event.wheel = notches;
  m_host.PutInput(event);
  ProgramThread::The().Resume();
}

void DialogDesk::Type(const std::string& text) {
  platform::InputEvent event;
  event.kind = platform::InputKind::kText;
  event.text = text;
  m_host.PutInput(event);
  ProgramThread::The().Resume();
}

void DialogDesk::Keys(const std::string& strokes) {
  std::istringstream words(strokes);
  for (std::string stroke; words >> stroke;) {
    if (stroke[0] == '\'') {
      Type(stroke.substr(1));
    } else {
      m_host.PutKey(stroke);
      ProgramThread::The().Resume();
    }
  }
}

void DialogDesk::Wallet(double dollars) { CTableState(View()).SetWallet(dollars); }

std::vector<std::string> DialogDesk::Windows() const {
  std::vector<std::string> titles;
  for (const auto* window : platform::TheApp().Screen().Windows()) {
    titles.push_back(window->GetTitle());
  }
  return titles;
}

platform::CDialog* DialogDesk::Dialog() const {
  const auto& windows = platform::TheApp().Screen().Windows();
  for (auto window = windows.rbegin(); window != windows.rend(); ++window) {
    if (auto* dialog = dynamic_cast<platform::CDialog*>(*window)) return dialog;
  }
  return nullptr;
}

platform::Rect DialogDesk::Place(const platform::CControl& control) const {
  return control.GetClientRect().Moved(control.ScreenOrigin());
}

Point DialogDesk::Middle(int controlID) const {
  const platform::Rect place = Place(Control(controlID));
  return {(place.left + place.right) / 2, (place.top + place.bottom) / 2};
}

int DialogDesk::Focus() const {
  const auto* control = static_cast<const platform::CControl*>(Dialog()->GetFocus());
  return control == nullptr ? 0 : control->GetID();
}

WriteWatch::WriteWatch() { g_writes.emplace(); }
WriteWatch::~WriteWatch() { g_writes.reset(); }

std::vector<std::string> WriteWatch::Take() { return std::exchange(g_writes.value(), {}); }

Json ControlOf(const Json& state, int number) {
  for (const Json& control : state["controls"]) {
    if (control["number"] == number) return control;
  }
  return {};
}

std::vector<std::string> SettingsIn(const std::string& profile) {
  std::vector<std::string> lines;
  std::istringstream stream(profile);
  for (std::string line; std::getline(stream, line);) {
    if (!line.empty() && line != "[Settings]") lines.push_back(line);
  }
  return lines;
}

}  // namespace feltside::tests

/// The program's renames come here instead of to the system's own function, as this one is found
/// first when the test is linked. It does the same.
extern "C" int rename(const char* from, const char* to) noexcept {
  const int result = renameat(AT_FDCWD, from, AT_FDCWD, to);
  if (result != 0 || !feltside::tests::g_writes) return result;
  for (const std::string& line : feltside::tests::SettingsIn(feltside::tests::ReadFile(to))) {
    feltside::tests::g_writes->push_back(line);
  }
  unlink(to);
  return result;
}
