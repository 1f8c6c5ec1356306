#include "tests/support/desk.h"

#include <condition_variable>
#include <mutex>
#include <thread>

#include "platform/window/frame_window.h"

namespace feltside::tests {
namespace {

using platform::InputEvent;
using platform::InputKind;
using platform::Point;

/// The thread in which the games run, one after another. There is one for all, as SDL keeps some
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

}  // namespace

void DeskHost::Show(const platform::CBitmap& frame) {
  OffscreenHost::Show(frame);
  if (m_fnOnFrame) m_fnOnFrame();
}

void DeskHost::WaitEvent(int milliseconds) {
  if (milliseconds >= 0 && m_fnOnPause) m_fnOnPause();
  OffscreenHost::WaitEvent(milliseconds);
}

void DeskHost::PutPointer(InputKind kind, Point at) {
  InputEvent event;
  event.kind = kind;
  event.at = at;
  PutInput(event);
}

void DeskHost::PutKey(const std::string& chord) {
  InputEvent event;
  event.kind = InputKind::kKey;
  event.stroke = platform::ParseChord(chord).value();
  PutInput(event);
}

Desk::Desk(const std::string& profile) {
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

Desk::~Desk() {
  m_bLeaving = true;
  Run();
}

bool Desk::Run() {
  if (m_bRunning) ProgramThread::The().Resume();
  return m_bRunning;
}

CTableState Desk::Table() const {
  return CTableState(static_cast<CFeltsideView&>(platform::TheApp().MainFrame()->View()));
}

Json Desk::State() const { return ReadJson(Table().Read().dump()); }

void Desk::Post(const platform::Message& message) { platform::TheApp().Queue().Post(message); }

void Desk::Command(int commandID) {
  platform::TheApp().Queue().PostCommand(commandID);
  Run();
}

platform::CDialog* Desk::Dialog() const {
  return dynamic_cast<platform::CDialog*>(platform::TheApp().Screen().Top());
}

}  // namespace feltside::tests
