// The program itself, on SDL's driver without a display.

#include <gtest/gtest.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>

#include "tests/support/child.h"
#include "tests/support/temporary_folder.h"

namespace feltside::tests {
namespace {

Child StartOn(const char* driver, const TemporaryFolder& folder) {
  // Or SDL looks for the desktop's bus, which loses memory where there is none.
  unsetenv("DISPLAY");
  setenv("SDL_VIDEODRIVER", driver, 1);
  const Child child = StartChild(FELTSIDE_PROGRAM, folder.Path());
  unsetenv("SDL_VIDEODRIVER");
  return child;
}

/// Whether a program has taken this signal over, by what Linux tells of it.
bool Heeds(int signal, const Child& program) {
  const std::string name = "SigCgt:";
  const std::string status = ReadFile("/proc/" + std::to_string(program.process) + "/status");
  const auto at = status.find(name);
  if (at == std::string::npos) return false;
  return (std::stoull(status.substr(at + name.size()), nullptr, 16) >> (signal - 1) & 1) != 0;
}

TEST(Program, RunsUntilItIsToldToEnd) {
  const TemporaryFolder folder;
  const Child child = StartOn("dummy", folder);
  for (int tries = 0; !Heeds(SIGTERM, child) && tries < 3000; ++tries) usleep(10000);
  kill(static_cast<pid_t>(child.process), SIGTERM);
  EXPECT_EQ(EndChild(child), 0);
  EXPECT_EQ(ReadFile(folder.Path() / "errors"), "");
}

TEST(Program, SaysWhyItCannotRun) {
  const TemporaryFolder folder;
  EXPECT_EQ(EndChild(StartOn("none", folder)), 3);
  EXPECT_EQ(ReadFile(folder.Path() / "errors"),
            "Feltside: No window can be shown: none not available.\n");
}

}  // namespace
}  // namespace feltside::tests
