#include <fcntl.h>
#include <io.h>
#include <process.h>
#include <sys/stat.h>

#include <array>
#include <cstdlib>
#include <stdexcept>

#include "tests/support/child.h"

namespace feltside::tests {
namespace {

namespace fs = std::filesystem;

using Streams = std::array<int, 3>;  ///< input, output, errors

/// Starts a program on these streams: it has for its own what the test has at that moment.
std::intptr_t Spawn(const fs::path& program, const Streams& streams) {
  Streams own{};
  for (int i = 0; i < 3; ++i) {
    own.at(static_cast<std::size_t>(i)) = _dup(i);
    _dup2(streams.at(static_cast<std::size_t>(i)), i);
  }
  const std::intptr_t process = _wspawnl(_P_NOWAIT, program.c_str(), program.c_str(), nullptr);
  for (int i = 0; i < 3; ++i) {
    _dup2(own.at(static_cast<std::size_t>(i)), i);
    _close(own.at(static_cast<std::size_t>(i)));
  }
  return process;
}

}  // namespace

Child StartChild(const fs::path& program, const fs::path& folder) {
  constexpr unsigned kPipeSize = 65536;
  std::array<int, 2> to{};
  std::array<int, 2> from{};
  if (_pipe(to.data(), kPipeSize, _O_BINARY | _O_NOINHERIT) != 0 ||
      _pipe(from.data(), kPipeSize, _O_BINARY | _O_NOINHERIT) != 0) {
    throw std::runtime_error("no pipe");
  }
  const int errors = _wopen((folder / "errors").c_str(),
                            _O_WRONLY | _O_CREAT | _O_TRUNC | _O_NOINHERIT, _S_IREAD | _S_IWRITE);
  _wputenv_s(L"APPDATA", folder.c_str());
  const std::intptr_t process = Spawn(program, {to[0], from[1], errors});
  for (const int stream : {to[0], from[1], errors}) _close(stream);
  if (process == -1) throw std::runtime_error("no program");
  return {process, _fdopen(to[1], "w"), _fdopen(from[0], "r")};
}

int EndChild(const Child& child) {
  std::fclose(child.input);
  int code = -1;
  _cwait(&code, child.process, 0);
  std::fclose(child.output);
  return code;
}

}  // namespace feltside::tests
