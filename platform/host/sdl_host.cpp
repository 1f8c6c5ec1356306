#include "platform/host/sdl_host.h"

#include <SDL.h>
#ifdef __GLIBC__
#include <malloc.h>
#endif

#include <ctime>
#include <string_view>
#include <utility>

#include "platform/host/help_viewer.h"
#include "platform/host/profile_folder.h"
#include "platform/host/sdl_keys.h"
#include "platform/host/sdl_window.h"

namespace platform {
namespace {

/// Whether keys are chords now and type nothing; some desktops send a text for them all the same.
/// The right Alt key types letters of its own.
bool IsChordHeld() {
  const SDL_Keymod held = SDL_GetModState();
  return (held & (KMOD_RALT | KMOD_MODE)) == 0 && (held & (KMOD_CTRL | KMOD_LALT)) != 0;
}

/// A text that SDL hands over, which may be none.
std::string TakeText(char* text) {
  std::string copy = text == nullptr ? "" : text;
  SDL_free(text);
  return copy;
}

/// SDL's subsystems for as long as the host lives.
class SdlVideo {
 public:
  SdlVideo() {
    // A card game that lies idle is no reason to keep the screen on.
    SDL_SetHint(SDL_HINT_VIDEO_ALLOW_SCREENSAVER, "1");
    // Nor to take the desktop's effects away from all other windows.
    SDL_SetHint(SDL_HINT_VIDEO_X11_NET_WM_BYPASS_COMPOSITOR, "0");
    SDL_SetHint(SDL_HINT_IME_SUPPORT_EXTENDED_TEXT, "1");
    SDL_SetHint(SDL_HINT_IME_SHOW_UI, "1");
    m_bReady = SDL_Init(SDL_INIT_VIDEO) == 0;
  }
  ~SdlVideo() { SDL_Quit(); }
  SdlVideo(const SdlVideo&) = delete;
  SdlVideo& operator=(const SdlVideo&) = delete;

  /// Without a display SDL draws into the void and tells nobody.
  bool HasDisplay() const {
    if (!m_bReady) return false;
    const std::string_view driver = SDL_GetCurrentVideoDriver();
    return driver != "offscreen" && driver != "dummy";
  }

 private:
  bool m_bReady = false;
};

class SdlHost : public Host {
 public:
  SdlHost(std::unique_ptr<SdlVideo> video, const SdlHostOptions& options)
      : m_pVideo(std::move(video)),
        m_window(options.frameSize),
        m_arrHelpFolders(options.helpFolders) {
    SDL_StopTextInput();
  }

  bool IsReady() const { return m_window.IsOpen(); }

  void Show(const CBitmap& frame) override { m_window.Show(frame); }
  void SetIdentity(const std::string& title, const std::optional<CBitmap>& icon) override {
    m_window.SetIdentity(title, icon);
  }
  void SetWindowPlace(const WindowPlace& place) override { m_window.SetPlace(place); }
  std::optional<WindowPlace> GetWindowPlace() override { return m_window.GetPlace(); }

  bool NextEvent(InputEvent& event) override {
    SDL_Event raw;
    while (SDL_PollEvent(&raw) != 0) {
      if (Translate(raw, event)) return true;
    }
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
    SDL_StartTextInput();
  }

  std::string GetClipboard() override { return TakeText(SDL_GetClipboardText()); }
  void SetClipboard(const std::string& text) override { SDL_SetClipboardText(text.c_str()); }

  bool StartHelpViewer(const std::string& commandLine) override {
    return platform::StartHelpViewer(m_arrHelpFolders, commandLine);
  }

  std::filesystem::path ProfileFolder() override { return DefaultProfileFolder(); }

 private:
  /// Answers whether the event is one for the program; those for the window alone are done here.
  bool Translate(const SDL_Event& raw, InputEvent& event);
  bool TranslatePointer(InputKind kind, Uint8 button, int x, int y, InputEvent& event) const;
  bool TranslateMiddleClick(const SDL_MouseButtonEvent& button, InputEvent& event) const;
  bool TranslateKey(const SDL_KeyboardEvent& key, InputEvent& event);

  std::unique_ptr<SdlVideo> m_pVideo;
  SdlWindow m_window;
  std::vector<std::filesystem::path> m_arrHelpFolders;
};

bool SdlHost::Translate(const SDL_Event& raw, InputEvent& event) {
  event = {};
  switch (raw.type) {
    case SDL_QUIT:
      event.kind = InputKind::kClose;
      return true;
    case SDL_WINDOWEVENT:
      m_window.Refresh();
      event.kind = InputKind::kPointerLeave;
      return raw.window.event == SDL_WINDOWEVENT_LEAVE;
    case SDL_MOUSEBUTTONDOWN:
      if (raw.button.button == SDL_BUTTON_MIDDLE) return TranslateMiddleClick(raw.button, event);
      return TranslatePointer(InputKind::kPointerDown, raw.button.button, raw.button.x,
                              raw.button.y, event);
    case SDL_MOUSEBUTTONUP:
      return TranslatePointer(InputKind::kPointerUp, raw.button.button, raw.button.x, raw.button.y,
                              event);
    case SDL_MOUSEMOTION:
      return TranslatePointer(InputKind::kPointerMove, SDL_BUTTON_LEFT, raw.motion.x, raw.motion.y,
                              event);
    case SDL_MOUSEWHEEL:
      event.kind = InputKind::kWheel;
      event.at = m_window.FramePoint(raw.wheel.mouseX, raw.wheel.mouseY);
      event.wheel = raw.wheel.y;
      return raw.wheel.y != 0;
    case SDL_KEYDOWN:
      return TranslateKey(raw.key, event);
    case SDL_TEXTINPUT:
      event.kind = InputKind::kText;
      event.text = raw.text.text;
      return !IsChordHeld();
    case SDL_TEXTEDITING:
      event.kind = InputKind::kComposition;
      event.text = raw.edit.text;
      return true;
    case SDL_TEXTEDITING_EXT:
      event.kind = InputKind::kComposition;
      event.text = TakeText(raw.editExt.text);
      return true;
    default:
      return false;
  }
}

bool SdlHost::TranslatePointer(InputKind kind, Uint8 button, int x, int y,
                               InputEvent& event) const {
  if (button != SDL_BUTTON_LEFT) return false;
  event.kind = kind;
  event.at = m_window.FramePoint(x, y);
  return true;
}

bool SdlHost::TranslateMiddleClick(const SDL_MouseButtonEvent& button, InputEvent& event) const {
  event.kind = InputKind::kMiddleClick;
  event.at = m_window.FramePoint(button.x, button.y);
  event.text = TakeText(SDL_GetPrimarySelectionText());
  return true;
}

bool SdlHost::TranslateKey(const SDL_KeyboardEvent& key, InputEvent& event) {
  if (key.keysym.sym == SDLK_F11) {
    if (key.repeat == 0) m_window.ToggleFullScreen();
    return false;
  }
  event.kind = InputKind::kKey;
  event.stroke = StrokeOf(key.keysym);
  return event.stroke.key != Key::kNone && (key.repeat == 0 || ActsWhileHeld(event.stroke.key));
}

/// A frame is composed in a block of its own at every paint. The memory of such blocks goes back to
/// the system at once, rather than staying with the process between paints.
void ReturnLargeBlocks() {
#ifdef __GLIBC__
  constexpr int kLargeBlock = 128 * 1024;
  mallopt(M_MMAP_THRESHOLD, kLargeBlock);
#endif
}

}  // namespace

std::unique_ptr<Host> CreateSdlHost(const SdlHostOptions& options, std::string& why) {
  ReturnLargeBlocks();
  auto video = std::make_unique<SdlVideo>();
  if (!video->HasDisplay()) {
    why = "There is no display to show a window on.";
    return nullptr;
  }
  auto host = std::make_unique<SdlHost>(std::move(video), options);
  if (!host->IsReady()) {
    why = std::string("The window cannot be opened: ") + SDL_GetError();
    return nullptr;
  }
  return host;
}

}  // namespace platform
