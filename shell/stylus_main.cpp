#include <cstdlib>
#include <filesystem>
#include <iostream>

#include "platform/offscreen_host.h"
#include "shell/stylus.h"

int main(int, char**) {
  const char* configured = std::getenv("XDG_CONFIG_HOME");
  // Without a folder of its own it would play with the person's settings.
  const std::filesystem::path folder =
      configured != nullptr ? configured
                            : std::filesystem::temp_directory_path() / "feltside-stylus";
  platform::OffscreenHost host(folder);
  platform::SetHost(&host);
  feltside::CFeltsideApp app;
  return feltside::CStylus(host, app, std::cin, std::cout).Run();
}
