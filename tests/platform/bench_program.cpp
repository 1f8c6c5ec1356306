#include "tests/platform/bench_program.h"

#include "platform/document_template.h"

namespace feltside::tests {
namespace {

using platform::CommandState;
using platform::Point;

BenchProgram& Program() { return static_cast<BenchProgram&>(platform::TheApp()); }

CommandState StateOf(int commandID, std::initializer_list<int> known) {
  for (const int id : known) {
    if (id != commandID) continue;
    return Program().Disabled().count(id) > 0 ? CommandState::kDisabled : CommandState::kEnabled;
  }
  return CommandState::kUnknown;
}

class BenchView : public platform::CView {
 public:
  explicit BenchView(platform::CFrameWindow& frame)
      : CView(&frame, platform::CFrameWindow::ViewPlace()) {}

  void OnDraw(platform::CSurface& surface) override {
    surface.FillRect(GetClientRect(), platform::kWhite);
  }
  void OnLButtonDown(Point p) override {
    Program().Remember("tap " + std::to_string(p.x) + " " + std::to_string(p.y));
  }
  bool OnKeyDown(const platform::KeyStroke& stroke) override {
    if (stroke.character != 'K') return false;
    Program().Remember("key K");
    return true;
  }
  CommandState QueryCommand(int commandID) const override {
    return StateOf(commandID, {kViewCommand, kDisablingCommand});
  }
  void RunCommand(int commandID) override {
    Program().Remember("run " + std::to_string(commandID));
    if (commandID == kDisablingCommand) Program().Disabled().insert(kViewCommand);
  }
};

class BenchFrame : public platform::CFrameWindow {
 public:
  explicit BenchFrame(const std::string& title)
      : CFrameWindow(title, {{platform::ParseChord("Ctrl+N").value(), kViewCommand}}) {}

  int OnCreate() override {
    m_bar.InsertMenuBar({"&File",
                         {{"&One", kViewCommand},
                          {"&Two", kDisablingCommand},
                          {"", 0},
                          {"Frame", kFrameCommand},
                          {"E&xit", platform::kCommandExit}}});
    m_bar.AddAdornments();
    m_bar.LoadToolBar({1, {16, 15}, {kViewCommand, 0, kDisablingCommand}});
    return 0;
  }
  void RefreshCommandStates() override { m_bar.RefreshStates(); }
  bool OnKeyDown(const platform::KeyStroke& stroke) override {
    return m_bar.OpenMenuByKey(stroke) || CFrameWindow::OnKeyDown(stroke);
  }
  void OnLButtonDown(Point) override { Program().Remember("tap on the frame"); }
  CommandState QueryCommand(int commandID) const override {
    return StateOf(commandID, {kFrameCommand, kViewCommand});
  }
  void RunCommand(int commandID) override {
    Program().Remember("frame runs " + std::to_string(commandID));
  }

 private:
  platform::CCommandBar m_bar{this, {0, 0, GetClientRect().right, kBarHeight}};
};

}  // namespace

BenchProgram::BenchProgram() : CApplication("Bench", {nullptr, 0}) {}

CommandState BenchProgram::QueryCommand(int commandID) const {
  return StateOf(commandID, {kProgramCommand, kFrameCommand, platform::kCommandExit});
}

void BenchProgram::RunCommand(int commandID) {
  Remember("program runs " + std::to_string(commandID));
}

bool BenchProgram::InitInstance() {
  platform::CSingleDocTemplate::Makers makers;
  makers.document = [] { return std::make_unique<platform::CDocument>(); };
  makers.frame = [](const std::string& title) { return std::make_unique<BenchFrame>(title); };
  makers.view = [](platform::CFrameWindow& frame) { return std::make_unique<BenchView>(frame); };
  AddDocTemplate(std::make_unique<platform::CSingleDocTemplate>("Bench\n\n\n\n\n\n", makers));
  if (!OpenNewDocument()) return false;
  ShowMainWindow(1);
  return true;
}

}  // namespace feltside::tests
