// The game without a window, played by commands. It reads and keeps settings where the game does,
// so whoever tries things out gives it an XDG_CONFIG_HOME of its own.

#include <iostream>

#include "platform/host/offscreen_host.h"
#include "platform/host/profile_folder.h"
#include "stylus/stylus.h"

int main(int, char**) {
  platform::OffscreenHost host(platform::DefaultProfileFolder());
  platform::SetHost(&host);
  feltside::CFeltsideApp app;
  return feltside::CStylus(host, app, std::cin, std::cout).Run();
}
