// The host with a window, on SDL's driver without a display: events are put in where the desktop
// puts them, and come out at the program's door.

#include <SDL.h>
#include <gtest/gtest.h>

#include <optional>

#include "platform/host/create_host.h"
#include "platform/host/frame_fit.h"

namespace feltside::tests {
namespace {

using platform::CBitmap;
using platform::InputEvent;
using platform::InputKind;
using platform::Pixel;
using platform::Point;
using platform::Rect;
using platform::Size;

constexpr Size kFrame{24, 30};
constexpr int kStep = 8;  ///< of the colour, from pixel to pixel

/// Every pixel tells where it is by its red and green.
CBitmap TellingFrame() {
  CBitmap frame(kFrame);
  for (int y = 0; y < kFrame.height; ++y) {
    for (int x = 0; x < kFrame.width; ++x) {
      frame.At({x, y}) = 0xFF000000U | static_cast<Pixel>(x * kStep << 16 | y * kStep << 8);
    }
  }
  return frame;
}

class SdlHostTest : public testing::Test {
 protected:
  const CBitmap m_frame = TellingFrame();

  SdlHostTest() {
    SDL_SetHint(SDL_HINT_VIDEODRIVER, "dummy");
    std::string why;
    m_pHost = platform::CreateHost({kFrame, {}}, why);
    EXPECT_NE(m_pHost, nullptr) << why;
  }

  static SDL_Window* Window() { return SDL_GetWindowFromID(1); }
  static void PutWindowAt(const Rect& rect) {
    SDL_SetWindowSize(Window(), rect.Width(), rect.Height());
    SDL_SetWindowPosition(Window(), rect.left, rect.top);
  }

  static void PutKey(Uint32 type, SDL_Keysym key, Uint8 repeat = 0) {
    SDL_Event raw{};
    raw.type = type;
    raw.key.keysym = key;
    raw.key.repeat = repeat;
    SDL_PushEvent(&raw);
  }
  static void PutText(const char* text) {
    SDL_Event raw{};
    raw.type = SDL_TEXTINPUT;
    SDL_strlcpy(raw.text.text, text, sizeof raw.text.text);
    SDL_PushEvent(&raw);
  }
  /// A move, or the wheel, there.
  static void PutMotion(Uint32 type, Point at) {
    SDL_Event raw{};
    raw.type = type;
    if (type == SDL_MOUSEWHEEL) {
      raw.wheel.y = 1;
      raw.wheel.mouseX = at.x;
      raw.wheel.mouseY = at.y;
    } else {
      raw.motion.x = at.x;
      raw.motion.y = at.y;
    }
    SDL_PushEvent(&raw);
  }
  static void PutButton(Uint32 type, Uint8 button, Point at) {
    SDL_Event raw{};
    raw.type = type;
    raw.button.button = button;
    raw.button.x = at.x;
    raw.button.y = at.y;
    SDL_PushEvent(&raw);
  }

  /// The only input that has come; nothing where there is none.
  std::optional<InputEvent> Next() {
    InputEvent event;
    InputEvent second;
    if (!m_pHost->NextEvent(event)) return std::nullopt;
    EXPECT_FALSE(m_pHost->NextEvent(second));
    return event;
  }
  std::optional<InputKind> NextKind() {
    const auto event = Next();
    return event ? std::optional(event->kind) : std::nullopt;
  }

  std::unique_ptr<platform::Host> m_pHost;
};

TEST_F(SdlHostTest, NamesKeysByWhatTheyDo) {
  struct Case {
    SDL_Keysym key;
    Uint8 repeat;
    const char* chord;  ///< null: nothing
  };
  const Case cases[] = {
      {{SDL_SCANCODE_RETURN, SDLK_RETURN, 0, 0}, 0, "Enter"},
      {{SDL_SCANCODE_KP_ENTER, SDLK_KP_ENTER, 0, 0}, 0, "Enter"},
      {{SDL_SCANCODE_TAB, SDLK_TAB, KMOD_LSHIFT, 0}, 0, "Shift+Tab"},
      {{SDL_SCANCODE_N, SDLK_n, KMOD_RCTRL, 0}, 0, "Ctrl+N"},
      {{SDL_SCANCODE_B, SDLK_b, KMOD_LALT, 0}, 0, "Alt+B"},
      {{SDL_SCANCODE_H, 0x440, 0, 0}, 0, "H"},  // a Cyrillic letter lies there
      {{SDL_SCANCODE_3, SDLK_QUOTEDBL, 0, 0}, 0, "3"},
      {{SDL_SCANCODE_EQUALS, SDLK_EQUALS, KMOD_LSHIFT, 0}, 0, "Shift++"},
      {{SDL_SCANCODE_KP_MINUS, SDLK_KP_MINUS, 0, 0}, 0, "-"},
      {{SDL_SCANCODE_KP_7, SDLK_KP_7, 0, 0}, 0, "Home"},
      {{SDL_SCANCODE_KP_7, SDLK_KP_7, KMOD_NUM, 0}, 0, "7"},
      {{SDL_SCANCODE_SPACE, SDLK_SPACE, 0, 0}, 0, "Space"},
      {{SDL_SCANCODE_LCTRL, SDLK_LCTRL, KMOD_LCTRL, 0}, 0, nullptr},
      {{SDL_SCANCODE_UP, SDLK_UP, 0, 0}, 1, "Up"},  // held down
      {{SDL_SCANCODE_H, SDLK_h, 0, 0}, 1, nullptr},
      {{SDL_SCANCODE_RETURN, SDLK_RETURN, 0, 0}, 1, nullptr},
  };
  for (const Case& c : cases) {
    PutKey(SDL_KEYDOWN, c.key, c.repeat);
    const auto event = Next();
    ASSERT_EQ(event.has_value(), c.chord != nullptr) << c.key.scancode;
    if (event) {
      EXPECT_EQ(event->stroke, platform::ParseChord(c.chord)) << c.chord;
    }
  }
}

TEST_F(SdlHostTest, TakesNoTextFromChordsHoweverLateItLooks) {
  m_pHost->SetTextInput(Rect{1, 1, 9, 9});
  struct Case {
    Uint16 held;
    bool typed;
  };
  const Case cases[] = {{0, true},
                        {KMOD_SHIFT, true},
                        {KMOD_LCTRL, false},
                        {KMOD_LALT, false},
                        {KMOD_LALT | KMOD_MODE, true},
                        {KMOD_RALT, true}};
  for (const Case& c : cases) {
    // A modifier alone is no input. It has long been let go when the events are looked at.
    PutKey(SDL_KEYDOWN, {SDL_SCANCODE_LCTRL, SDLK_LCTRL, c.held, 0});
    PutText("\xC3\xA4");
    PutKey(SDL_KEYUP, {SDL_SCANCODE_LCTRL, SDLK_LCTRL, 0, 0});
    const auto event = Next();
    ASSERT_EQ(event.has_value(), c.typed) << c.held;
    if (event) {
      EXPECT_EQ(event->text, "\xC3\xA4");
    }
  }
  PutText("a");
  EXPECT_EQ(NextKind(), InputKind::kText);
}

TEST_F(SdlHostTest, TellsWhatIsBeingComposed) {
  m_pHost->SetTextInput(Rect{1, 1, 9, 9});
  SDL_Event raw{};
  raw.type = SDL_TEXTEDITING;
  SDL_strlcpy(raw.edit.text, "ni", sizeof raw.edit.text);
  SDL_PushEvent(&raw);
  EXPECT_EQ(Next().value().text, "ni");
  const std::string whole(100, 'n');
  raw.type = SDL_TEXTEDITING_EXT;
  raw.editExt.text = SDL_strdup(whole.c_str());
  SDL_PushEvent(&raw);
  const auto event = Next();
  EXPECT_EQ(event.value().kind, InputKind::kComposition);
  EXPECT_EQ(event->text, whole);
}

TEST_F(SdlHostTest, TellsWhatThePointerDoes) {
  PutButton(SDL_MOUSEBUTTONDOWN, SDL_BUTTON_LEFT, {1, 1});
  EXPECT_EQ(NextKind(), InputKind::kPointerDown);
  PutButton(SDL_MOUSEBUTTONUP, SDL_BUTTON_LEFT, {1, 1});
  EXPECT_EQ(NextKind(), InputKind::kPointerUp);
  PutButton(SDL_MOUSEBUTTONDOWN, SDL_BUTTON_RIGHT, {1, 1});
  EXPECT_EQ(NextKind(), std::nullopt);
  PutButton(SDL_MOUSEBUTTONDOWN, SDL_BUTTON_MIDDLE, {1, 1});
  PutButton(SDL_MOUSEBUTTONUP, SDL_BUTTON_MIDDLE, {1, 1});
  EXPECT_EQ(NextKind(), InputKind::kMiddleClick);

  SDL_Event raw{};
  raw.type = SDL_MOUSEMOTION;
  SDL_PushEvent(&raw);
  EXPECT_EQ(NextKind(), InputKind::kPointerMove);
  raw.motion.which = SDL_TOUCH_MOUSEID;  // a finger does not hover
  SDL_PushEvent(&raw);
  EXPECT_EQ(NextKind(), std::nullopt);
  raw.motion.state = SDL_BUTTON_LMASK;
  SDL_PushEvent(&raw);
  EXPECT_EQ(NextKind(), InputKind::kPointerMove);

  raw = {};
  raw.type = SDL_WINDOWEVENT;
  raw.window.event = SDL_WINDOWEVENT_LEAVE;
  SDL_PushEvent(&raw);
  EXPECT_EQ(NextKind(), InputKind::kPointerLeave);
  raw = {};
  raw.type = SDL_MOUSEWHEEL;
  raw.wheel.y = -2;
  SDL_PushEvent(&raw);
  EXPECT_EQ(Next().value().wheel, -2);
  raw = {};
  raw.type = SDL_QUIT;
  SDL_PushEvent(&raw);
  EXPECT_EQ(NextKind(), InputKind::kClose);
}

TEST_F(SdlHostTest, RefusesWhatIsDropped) {
  EXPECT_EQ(SDL_GetEventState(SDL_DROPFILE), SDL_DISABLE);
  EXPECT_EQ(SDL_GetEventState(SDL_DROPTEXT), SDL_DISABLE);
}

Pixel PixelOf(const SDL_Surface& screen, Point at) {
  const auto* line = static_cast<const Uint8*>(screen.pixels) + std::ptrdiff_t{screen.pitch} * at.y;
  return reinterpret_cast<const Pixel*>(line)[at.x] & 0xFFFFFFU;
}

/// Whether a place of the window shows a pixel of the frame, mixed with no more than as much of its
/// neighbours.
bool IsSeenAt(const SDL_Surface& screen, Point at, Point inFrame) {
  const Pixel pixel = PixelOf(screen, at);
  const auto is = [](Pixel level, int cell) {
    return std::abs(static_cast<int>(level & 0xFF) - cell * kStep) <= kStep / 2 + 1;
  };
  return is(pixel >> 16, inFrame.x) && is(pixel >> 8, inFrame.y);
}

TEST_F(SdlHostTest, HitsWhatIsSeenAtEverySize) {
  m_pHost->Show(m_frame);
  for (int step = 0; step < 20; ++step) {
    const Size size{18 + 5 * step, 30 + 4 * step};
    SDL_SetWindowSize(Window(), size.width, size.height);
    EXPECT_FALSE(Next());
    const SDL_Surface& screen = *SDL_GetWindowSurface(Window());
    const Rect place = platform::FrameFit(kFrame, size).Place();
    if (!place.Contains({})) {
      EXPECT_EQ(PixelOf(screen, {}), 0x202020U);
    }
    for (int y = place.top; y < place.bottom; ++y) {
      const Point at{place.left + y % place.Width(), y};
      if (y % 2 == 0) PutButton(SDL_MOUSEBUTTONDOWN, SDL_BUTTON_LEFT, at);
      if (y % 2 == 1) PutMotion(y % 4 == 1 ? SDL_MOUSEMOTION : SDL_MOUSEWHEEL, at);
      EXPECT_TRUE(IsSeenAt(screen, at, Next().value().at)) << size.width << " " << at.x << " " << y;
    }
  }
}

TEST_F(SdlHostTest, FillsTheDisplayAndComesBack) {
  m_pHost->Show(m_frame);
  const SDL_Keysym f11{SDL_SCANCODE_F11, SDLK_F11, 0, 0};
  PutKey(SDL_KEYDOWN, f11);
  PutKey(SDL_KEYDOWN, f11, 1);  // held down
  EXPECT_FALSE(Next());
  EXPECT_NE(SDL_GetWindowFlags(Window()) & SDL_WINDOW_FULLSCREEN, 0U);
  PutKey(SDL_KEYDOWN, f11);
  EXPECT_FALSE(Next());
  EXPECT_EQ(SDL_GetWindowFlags(Window()) & SDL_WINDOW_FULLSCREEN, 0U);
  EXPECT_FALSE(m_pHost->GetWindowPlace());
}

TEST_F(SdlHostTest, OpensWhereItIsPutAndTellsWhereItWasMoved) {
  m_pHost->SetWindowPlace({{5000, 10, 5300, 310}, false});
  m_pHost->Show(m_frame);
  const Rect opened = m_pHost->GetWindowPlace().value().rect;
  SDL_Rect display;
  SDL_GetDisplayBounds(0, &display);
  EXPECT_EQ(opened, platform::RectAt({display.w - 300, 10}, {300, 300}));
  const Rect moved{20, 30, 320, 400};
  PutWindowAt(moved);
  EXPECT_FALSE(Next());
  EXPECT_EQ(m_pHost->GetWindowPlace().value().rect, moved);
}

}  // namespace
}  // namespace feltside::tests
