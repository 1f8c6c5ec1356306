// The host with a window on desktops of other kinds than SDL's driver without a display makes up:
// these functions stand in place of SDL's.

#include <SDL.h>
#include <dlfcn.h>
#include <gmock/gmock.h>

#include <cstdlib>
#include <utility>

#include "platform/host/create_host.h"
#include "platform/host/sdl_fonts.h"
#include "tests/support/temporary_folder.h"

namespace feltside::tests {
namespace {

using platform::CBitmap;
using platform::Point;
using platform::Rect;
using platform::Size;
using testing::StartsWith;

/// What is particular about a desktop, and what it was told.
struct Desktop {
  bool plain = true;        ///< takes pixels as they are
  bool knownPixels = true;  ///< has a format that SDL knows
  int sharpness = 1;        ///< pixels for each step of a place
  SDL_Rect room{};          ///< what panels leave to windows; empty: all
  int bar = 0;              ///< rows that a window is moved down by when it opens
  Uint32 flags = 0;         ///< of the window, besides SDL's own
  SDL_Rect textPlace{};     ///< where the keyboard works
  CBitmap icon;             ///< the window's
  CBitmap shown;            ///< in the window
};
Desktop g_desktop;

template <class Function>
Function* Real(Function&, const char* name) {
  return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

CBitmap CopyOf(const SDL_Surface& surface) {
  CBitmap copy({surface.w, surface.h});
  SDL_ConvertPixels(surface.w, surface.h, surface.format->format, surface.pixels, surface.pitch,
                    SDL_PIXELFORMAT_ARGB8888, &copy.At({0, 0}), surface.w * 4);
  return copy;
}

int Keep(SDL_Window* window) {
  g_desktop.shown = CopyOf(*Real(SDL_GetWindowSurface, "SDL_GetWindowSurface")(window));
  return 0;
}

}  // namespace

extern "C" SDL_Surface* SDL_GetWindowSurface(SDL_Window* window) {
  return g_desktop.plain ? Real(SDL_GetWindowSurface, "SDL_GetWindowSurface")(window) : nullptr;
}

extern "C" int SDL_UpdateWindowSurface(SDL_Window* window) { return Keep(window); }

extern "C" void SDL_RenderPresent(SDL_Renderer* renderer) {
  Real(SDL_RenderPresent, "SDL_RenderPresent")(renderer);
  Keep(SDL_RenderGetWindow(renderer));
}

extern "C" int SDL_GetDisplayUsableBounds(int display, SDL_Rect* rect) {
  const int answer = Real(SDL_GetDisplayUsableBounds, "SDL_GetDisplayUsableBounds")(display, rect);
  if (SDL_RectEmpty(&g_desktop.room) == SDL_FALSE) *rect = g_desktop.room;
  return answer;
}

extern "C" int SDL_GetDesktopDisplayMode(int display, SDL_DisplayMode* mode) {
  const int answer = Real(SDL_GetDesktopDisplayMode, "SDL_GetDesktopDisplayMode")(display, mode);
  if (!g_desktop.knownPixels) mode->format = SDL_PIXELFORMAT_UNKNOWN;
  return answer;
}

extern "C" void SDL_GetWindowSizeInPixels(SDL_Window* window, int* width, int* height) {
  Real(SDL_GetWindowSizeInPixels, "SDL_GetWindowSizeInPixels")(window, width, height);
  *width *= g_desktop.sharpness;
  *height *= g_desktop.sharpness;
}

extern "C" void SDL_ShowWindow(SDL_Window* window) {
  Real(SDL_ShowWindow, "SDL_ShowWindow")(window);
  Point at;
  SDL_GetWindowPosition(window, &at.x, &at.y);
  SDL_SetWindowPosition(window, at.x, at.y + g_desktop.bar);
}

extern "C" void SDL_MaximizeWindow(SDL_Window*) { g_desktop.flags = SDL_WINDOW_MAXIMIZED; }

extern "C" Uint32 SDL_GetWindowFlags(SDL_Window* window) {
  return Real(SDL_GetWindowFlags, "SDL_GetWindowFlags")(window) | g_desktop.flags;
}

extern "C" void SDL_SetTextInputRect(const SDL_Rect* rect) { g_desktop.textPlace = *rect; }

extern "C" void SDL_SetWindowIcon(SDL_Window*, SDL_Surface* icon) {
  g_desktop.icon = CopyOf(*icon);
}

namespace {

constexpr Size kFrame{24, 30};

class SdlDesktopTest : public testing::Test {
 protected:
  ~SdlDesktopTest() override { g_desktop = {}; }

  void Open() {
    SDL_SetHint(SDL_HINT_VIDEODRIVER, "dummy");
    m_pHost = platform::CreateHost({kFrame, {}}, m_strWhy);
    ASSERT_NE(m_pHost, nullptr) << m_strWhy;
    // The first was given up where the desktop is not plain.
    m_pWindow = SDL_GetWindowFromID(g_desktop.plain ? 1 : 2);
  }
  std::string Trouble() {
    EXPECT_EQ(platform::CreateHost({kFrame, {}}, m_strWhy), nullptr);
    return m_strWhy;
  }
  Rect WindowPlace() const {
    Point at;
    Size size;
    SDL_GetWindowPosition(m_pWindow, &at.x, &at.y);
    SDL_GetWindowSize(m_pWindow, &size.width, &size.height);
    return RectAt(at, size);
  }
  void HandleEvents() {
    platform::InputEvent event;
    while (m_pHost->NextEvent(event)) {
    }
  }

  std::string m_strWhy;
  std::unique_ptr<platform::Host> m_pHost;
  SDL_Window* m_pWindow = nullptr;
};

TEST_F(SdlDesktopTest, ShowsThePictureWhetherOrNotTheDesktopTakesPlainPixels) {
  CBitmap frame(kFrame, platform::Rgb(1, 2, 3));
  frame.At({23, 29}) = 0xFF040506U;
  for (const bool plain : {true, false}) {
    g_desktop.plain = plain;
    Open();
    m_pHost->Show(frame);
    for (const int scale : {3, 2}) {
      SDL_SetWindowSize(m_pWindow, 24 * scale, 30 * scale);
      HandleEvents();
      ASSERT_EQ(g_desktop.shown.GetSize(), (Size{24 * scale, 30 * scale}));
      EXPECT_EQ(g_desktop.shown.At({0, 0}), 0xFF010203U);
      EXPECT_EQ(g_desktop.shown.At({24 * scale - 1, 30 * scale - 1}), 0xFF040506U);
    }
    // It is not drawn again before what lay over it has gone.
    const CBitmap before = std::exchange(g_desktop.shown, {});
    HandleEvents();
    EXPECT_EQ(g_desktop.shown, CBitmap());
    SDL_Event raw{};
    raw.type = SDL_WINDOWEVENT;
    raw.window.event = SDL_WINDOWEVENT_EXPOSED;
    SDL_PushEvent(&raw);
    HandleEvents();
    EXPECT_EQ(g_desktop.shown, before);
    m_pHost.reset();
  }
}

TEST_F(SdlDesktopTest, OpensAsLargeAsFeelsComfortable) {
  struct Case {
    Size room;
    Size opened;
    int sharpness = 1;
  };
  for (const Case& c : {Case{{1024, 768}, {552, 690}},
                        {{2000, 1000}, {720, 900}},  // nine tenths are 30 times the picture
                        {{2000, 999}, {696, 870}},
                        {{216, 1000}, {168, 210}},  // room for a bar, 7 times as wide
                        {{215, 1000}, {144, 180}},
                        {{2000, 88}, {24, 30}},  // once takes three quarters of the room
                        {{2000, 89}, {33, 41}},
                        {{2000, 95}, {36, 45}, 2}}) {  // three times in pixels, and not {38, 47}
    g_desktop.sharpness = c.sharpness;
    g_desktop.room = {0, 0, c.room.width, c.room.height};
    Open();
    EXPECT_EQ(WindowPlace(), RectAt(WindowPlace().TopLeft(), c.opened))
        << c.room.width << " " << c.room.height;
    m_pHost.reset();
  }
}

TEST_F(SdlDesktopTest, PutsNameIconAndKeyboardWhereTheyBelong) {
  Open();
  CBitmap icon({2, 1}, platform::Rgb(1, 2, 3));
  icon.At({1, 0}) = 0x80040506U;
  m_pHost->SetIdentity("Cards", icon);
  EXPECT_STREQ(SDL_GetWindowTitle(m_pWindow), "Cards");
  EXPECT_EQ(g_desktop.icon, icon);
  // On a sharp display the picture stands 21 times as large, 48 pixels from the left and 5 from the
  // top; two of them make a step.
  g_desktop.sharpness = 2;
  SDL_SetWindowSize(m_pWindow, 300, 320);
  m_pHost->SetTextInput(Rect{2, 3, 5, 7});
  const SDL_Rect& place = g_desktop.textPlace;
  EXPECT_EQ((Rect{place.x, place.y, place.w, place.h}), (Rect{45, 34, 31, 42}));
  SDL_Event raw{};
  raw.type = SDL_MOUSEMOTION;
  raw.motion.x = place.x;
  raw.motion.y = place.y;
  SDL_PushEvent(&raw);
  platform::InputEvent event;
  ASSERT_TRUE(m_pHost->NextEvent(event));
  EXPECT_EQ(event.at, (Point{2, 3}));
}

TEST_F(SdlDesktopTest, StandsBelowTheBarAndDoesNotWander) {
  g_desktop.bar = 20;
  struct Case {
    Rect asked;
    Rect seen;
    int told = 0;  ///< a bar above what is seen
  };
  const CBitmap frame(kFrame);
  for (const Case& c : {Case{{100, 200, 400, 500}, {100, 220, 400, 520}, 200},
                        {{100, 0, 400, 300}, {100, 20, 400, 320}, 0},
                        {{100, 468, 400, 768}, {100, 468, 400, 768}, 448},
                        {{100, 0, 400, 768}, {100, 20, 400, 768}, 0}}) {
    Open();
    m_pHost->SetWindowPlace({c.asked, false});
    m_pHost->Show(frame);
    HandleEvents();
    EXPECT_EQ(WindowPlace(), c.seen);
    EXPECT_EQ(m_pHost->GetWindowPlace().value().rect.TopLeft(), (Point{100, c.told}));
    SDL_SetWindowPosition(m_pWindow, 50, 60);
    HandleEvents();
    EXPECT_EQ(m_pHost->GetWindowPlace().value().rect.TopLeft(), (Point{50, 40}));
    m_pHost.reset();
  }
}

TEST_F(SdlDesktopTest, IsMaximizedAgainAfterItFilledTheDisplay) {
  const platform::WindowPlace place{{100, 200, 400, 500}, true};
  const CBitmap frame(kFrame);
  Open();
  m_pHost->SetWindowPlace(place);
  m_pHost->Show(frame);
  EXPECT_EQ(m_pHost->GetWindowPlace(), place);
  for (const bool fills : {true, false}) {
    SDL_Event raw{};
    raw.type = SDL_KEYDOWN;
    raw.key.keysym.sym = SDLK_F11;
    SDL_PushEvent(&raw);
    HandleEvents();
    EXPECT_EQ(m_pHost->GetWindowPlace(), place);
    EXPECT_EQ(g_desktop.flags, SDL_WINDOW_MAXIMIZED);
    if (fills) g_desktop.flags = 0;  // on most desktops
  }
}

TEST_F(SdlDesktopTest, TellsWhyNoWindowCanBeShown) {
  SDL_SetHint(SDL_HINT_VIDEODRIVER, "dummy");
  g_desktop.knownPixels = false;
  EXPECT_THAT(Trouble(), StartsWith("The display cannot be drawn on: "));
  g_desktop.knownPixels = true;
  // Left alone, SDL looks for a desktop.
  unsetenv("SDL_VIDEODRIVER");
  setenv("XDG_RUNTIME_DIR", "/nowhere", 1);
  unsetenv("DISPLAY");
  EXPECT_THAT(Trouble(), StartsWith("There is no display to show a window on."));
  setenv("DISPLAY", "", 1);
  EXPECT_THAT(Trouble(), StartsWith("There is no display to show a window on."));
  setenv("DISPLAY", ":nowhere", 1);
  EXPECT_THAT(Trouble(),
              StartsWith("The display :nowhere cannot show a window: x11 not available"));
}

TEST(SdlFonts, AreThoseThatTheDesktopPrefers) {
  const TemporaryFolder folder;
  const auto config = folder.Path() / "fonts.conf";
  const std::filesystem::path preferred = FELTSIDE_SECOND_FACE;
  WriteFile(config, "<fontconfig><dir>" + preferred.parent_path().string() + "</dir><cachedir>" +
                        folder.Path().string() +
                        "</cachedir><match><test name='family'><string>sans-serif</string></test>"
                        "<edit name='family' mode='prepend'><string>Liberation Serif</string>"
                        "</edit></match></fontconfig>");
  setenv("FONTCONFIG_FILE", config.c_str(), 1);
  EXPECT_EQ(platform::FindDesktopFont(U'A').path, preferred);
  unsetenv("FONTCONFIG_FILE");
}

}  // namespace
}  // namespace feltside::tests
