#pragma once

#include <string>

#include "platform/host/sdl_desktop.h"

namespace platform {

/// SDL with the way to the display that it has found, for as long as this lives.
class SdlVideo {
 public:
  SdlVideo();
  ~SdlVideo();
  SdlVideo(const SdlVideo&) = delete;
  SdlVideo& operator=(const SdlVideo&) = delete;

  /// Why no window can be shown, as a sentence; empty where one can. SDL takes a way that shows
  /// nothing where it finds no other, and does not say so; whoever asks for such a one by name,
  /// with SDL_VIDEODRIVER, has it.
  const std::string& Trouble() const { return m_strTrouble; }

 private:
  DesktopPatience m_patience;
  std::string m_strTrouble;
};

}  // namespace platform
