#include <SDL.h>

#include <ctime>
#include <utility>

#include "platform/host/create_host.h"
#include "platform/host/help_viewer.h"
#include "platform/host/profile_folder.h"
#include "platform/host/sdl_desktop.h"
#include "platform/host/sdl_events.h"
#include "platform/host/sdl_fonts.h"
#include "platform/host/sdl_video.h"
#include "platform/host/sdl_window.h"

namespace platform {
namespace {

class SdlHost : public Host {
 public:
  SdlHost(std::unique_ptr<SdlVideo> video, const HostOptions& options)
      : m_pVideo(std::move(video)),
        m_window(options.frameSize),
        m_events(m_window),
        m_arrHelpFolders(options.helpFolders) {
    SetFontFinder(FindDesktopFont);
  }
  ~SdlHost() override { SetFontFinder(nullptr); }
  SdlHost(const SdlHost&) = delete;
  SdlHost& operator=(const SdlHost&) = delete;

  bool IsReady() const { return m_window.IsOpen(); }

  void Show(const CBitmap& frame) override { m_window.Show(frame); }
  void SetIdentity(const std::string& title, const std::optional<CBitmap>& icon) override {
    m_window.SetIdentity(title, icon);
  }
  void SetWindowPlace(const WindowPlace& place) override { m_window.Placement().Ask(place); }
  std::optional<WindowPlace> GetWindowPlace() override { return m_window.Placement().Place(); }

  bool NextEvent(InputEvent& event) override {
    SDL_Event raw;
    while (SDL_PollEvent(&raw) != 0) {
      if (m_events.Translate(raw, event)) return true;
    }
    m_window.Settle();
    return false;
  }

  void WaitEvent(int milliseconds) override {
    if (milliseconds < 0) {
      SDL_WaitEvent(nullptr);
    } else {
      SDL_WaitEventTimeout(nullptr, milliseconds);
    }
  }

  std::int64_t Ticks() override { return static_cast<std::int64_t>(SDL_GetTicks64()); }

  LocalTime Now() override {
    const std::time_t now = std::time(nullptr);
    const std::tm* local = std::localtime(&now);
    return {local->tm_year + 1900, local->tm_mon + 1, local->tm_mday,
            local->tm_hour,        local->tm_min,     local->tm_sec};
  }

  void SetTextInput(const std::optional<Rect>& place) override {
    if (!place) return SDL_StopTextInput();
    const SDL_Rect rect = m_window.WindowRect(*place);
    SDL_SetTextInputRect(&rect);
    // Asked for again, it would end what is being composed.
    if (SDL_IsTextInputActive() == SDL_FALSE) SDL_StartTextInput();
  }

  std::string GetClipboard() override { return TakeText(SDL_GetClipboardText()); }
  void SetClipboard(const std::string& text) override { SDL_SetClipboardText(text.c_str()); }

  // SDL knows no way to a desktop's screen readers.
  bool HasVoice() const override { return false; }
  void Say(const std::string&) override {}

  std::string StartHelpViewer(const std::string& commandLine) override {
    // Long enough for an opener to find no browser, and short beside a browser's start.
    constexpr int kPatience = 1000;
    return platform::StartHelpViewer(m_arrHelpFolders, commandLine, kPatience);
  }

  std::filesystem::path ProfileFolder() override { return DefaultProfileFolder(); }

 private:
  std::unique_ptr<SdlVideo> m_pVideo;
  SdlWindow m_window;
  SdlEvents m_events;
  std::vector<std::filesystem::path> m_arrHelpFolders;
};

}  // namespace

std::unique_ptr<Host> CreateHost(const HostOptions& options, std::string& why) {
  auto video = std::make_unique<SdlVideo>();
  why = video->Trouble();
  if (why.empty()) {
    auto host = std::make_unique<SdlHost>(std::move(video), options);
    if (host->IsReady()) return host;
    why = std::string("The window cannot be opened: ") + SDL_GetError();
  }
  ShowTrouble(why);
  return nullptr;
}

}  // namespace platform
