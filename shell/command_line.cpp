#include "shell/command_line.h"

#include <cstdio>
#include <cstdlib>
#include <string_view>

namespace feltside {
namespace {

constexpr int kExitRefused = 2;

constexpr char kUsage[] =
    "Usage: feltside [--help | --version]\n"
    "Plays blackjack and video poker in a window of its own.\n"
    "\n"
    "  --help     show this text and end\n"
    "  --version  show the version and end\n";

}  // namespace

std::optional<int> AnswerCommandLine(int argc, char** argv) {
  if (argc < 2) return std::nullopt;
  for (int i = 1; i < argc; ++i) {
    const std::string_view word = argv[i];
    if (word == "--help" || word == "--version") continue;
    std::fprintf(stderr, "feltside: no such option: %s\nTry \"feltside --help\".\n", argv[i]);
    return kExitRefused;
  }
  if (argv[1] == std::string_view("--help")) {
    std::fputs(kUsage, stdout);
  } else {
    std::puts("Feltside " FELTSIDE_VERSION);
  }
  return EXIT_SUCCESS;
}

}  // namespace feltside
