#include "tests/support/stylus.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cstdlib>
#include <memory>
#include <stdexcept>

#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

[[noreturn]] void BecomeProgram(int input, int output, const TemporaryFolder& folder) {
  const int errors = open((folder.Path() / "errors").c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
  dup2(input, STDIN_FILENO);
  dup2(output, STDOUT_FILENO);
  dup2(errors, STDERR_FILENO);
  setenv("XDG_CONFIG_HOME", folder.Path().c_str(), 1);
  // Another edition's, where the environment names one.
  const char* const other = std::getenv("FELTSIDE_STYLUS");
  const char* const program = other == nullptr ? FELTSIDE_STYLUS : other;
  execl(program, program, nullptr);
  _exit(127);
}

}  // namespace

Stylus::Stylus(const std::string& profile) {
  if (!profile.empty()) WriteFile(ProfileFile(), profile);
  std::array<int, 2> to{};
  std::array<int, 2> from{};
  if (pipe2(to.data(), O_CLOEXEC) != 0 || pipe2(from.data(), O_CLOEXEC) != 0) {
    throw std::runtime_error("no pipe");
  }
  m_process = fork();
  if (m_process == 0) BecomeProgram(to[0], from[1], m_folder);
  close(to[0]);
  close(from[1]);
  m_pToProgram = fdopen(to[1], "w");
  m_pFromProgram = fdopen(from[0], "r");
}

Stylus::~Stylus() {
  std::fclose(m_pToProgram);
  int status = 0;
  waitpid(m_process, &status, 0);
  std::fclose(m_pFromProgram);
  const std::string errors = Errors();
  EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0) << status << "\n" << errors;
  EXPECT_EQ(errors.find("Sanitizer"), std::string::npos) << errors;
  EXPECT_EQ(errors.find("runtime error"), std::string::npos) << errors;
}

Json Stylus::Send(const std::string& line) {
  std::fputs((line + "\n").c_str(), m_pToProgram);
  std::fflush(m_pToProgram);
  char* text = nullptr;
  std::size_t size = 0;
  const ssize_t length = getline(&text, &size, m_pFromProgram);
  const std::unique_ptr<char, decltype(&std::free)> owned(text, &std::free);
  if (length < 0) throw std::runtime_error("no answer to: " + line + "\n" + Errors());
  return Json::parse(text);
}

platform::CBitmap Stylus::Shot() {
  const std::string file = m_folder.Path() / "shot.png";
  Send("shot " + file);
  return LoadPicture(file);
}

std::filesystem::path Stylus::ProfileFile() const {
  return m_folder.Path() / "Quillworks" / "Feltside.toml";
}

}  // namespace feltside::tests
