#include <cstdio>

#include "platform/host/create_host.h"
#include "shell/command_line.h"
#include "shell/feltside_app.h"
#include "shell/res/frame_resources.h"

namespace {
/// Tells a caller that nothing but a display was missing.
constexpr int kExitNoDisplay = 3;
}  // namespace

int main(int argc, char** argv) {
  if (const auto exitCode = feltside::AnswerCommandLine(argc, argv)) return *exitCode;
  std::string why;
  const auto host = platform::CreateHost({feltside::kWindowSize, {FELTSIDE_HELP_FOLDERS}}, why);
  if (host == nullptr) {
    std::fprintf(stderr, "Feltside: %s\n", why.c_str());
    return kExitNoDisplay;
  }
  platform::SetHost(host.get());
  return feltside::CFeltsideApp().Main();
}
