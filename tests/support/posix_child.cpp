#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <cstdlib>
#include <stdexcept>

#include "tests/support/child.h"

namespace feltside::tests {
namespace {

namespace fs = std::filesystem;

[[noreturn]] void BecomeProgram(int input, int output, const fs::path& program,
                                const fs::path& folder) {
  const int errors = open((folder / "errors").c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
  dup2(input, STDIN_FILENO);
  dup2(output, STDOUT_FILENO);
  dup2(errors, STDERR_FILENO);
  setenv("XDG_CONFIG_HOME", folder.c_str(), 1);
  execl(program.c_str(), program.c_str(), nullptr);
  _exit(127);
}

}  // namespace

Child StartChild(const fs::path& program, const fs::path& folder) {
  std::signal(SIGPIPE, SIG_IGN);  // one that has died shows as a failed test
  std::array<int, 2> to{};
  std::array<int, 2> from{};
  if (pipe2(to.data(), O_CLOEXEC) != 0 || pipe2(from.data(), O_CLOEXEC) != 0) {
    throw std::runtime_error("no pipe");
  }
  const pid_t process = fork();
  if (process == 0) BecomeProgram(to[0], from[1], program, folder);
  close(to[0]);
  close(from[1]);
  return {process, fdopen(to[1], "w"), fdopen(from[0], "r")};
}

int EndChild(const Child& child) {
  std::fclose(child.input);
  int status = 0;
  waitpid(static_cast<pid_t>(child.process), &status, 0);
  std::fclose(child.output);
  return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

}  // namespace feltside::tests
