#include <cstdlib>
#include <utility>

#include "platform/host/create_host.h"
#include "platform/host/frame_fit.h"
#include "platform/host/web_page.h"

namespace platform {
namespace {

std::string TakeText(char* text) {
  std::string copy = text;
  std::free(text);
  return copy;
}

/// A page with one canvas, worked by its script.
class WebHost : public Host {
 public:
  explicit WebHost(Size frameSize) : m_frameSize(frameSize), m_fit(frameSize, frameSize) {}
  ~WebHost() override { page_end(); }

  void Show(const CBitmap& frame) override {
    page_show(frame.Pixels().data(), frame.GetSize().width, frame.GetSize().height);
  }
  // The page has a title and an icon of its own, and the browser a place for it.
  void SetIdentity(const std::string&, const std::optional<CBitmap>&) override {}
  void SetWindowPlace(const WindowPlace&) override {}
  std::optional<WindowPlace> GetWindowPlace() override { return std::nullopt; }

  bool NextEvent(InputEvent& event) override;
  void WaitEvent(int milliseconds) override { page_wait(milliseconds); }
  std::int64_t Ticks() override { return static_cast<std::int64_t>(page_ticks()); }
  LocalTime Now() override {
    int now[6];
    page_local_time(now);
    return {now[0], now[1], now[2], now[3], now[4], now[5]};
  }

  void SetTextInput(const std::optional<Rect>& place) override {
    if (!place) return page_want_no_text();
    page_want_text(place->left, place->top, place->Width(), place->Height());
  }
  std::string GetClipboard() override { return TakeText(page_clipboard()); }
  void SetClipboard(const std::string& text) override { page_set_clipboard(text.c_str()); }
  bool HasVoice() const override { return true; }
  void Say(const std::string& text) override { page_say(text.c_str()); }

  std::string StartHelpViewer(const std::string& commandLine) override;
  // What is kept for a page has a place of its own, without folders above it.
  std::filesystem::path ProfileFolder() override { return "/"; }

 private:
  bool Translate(const PageEvent& raw, InputEvent& event);
  bool TranslateKey(const PageEvent& raw, InputEvent& event) const;
  void FillRoom(Size room);

  Size m_frameSize;
  FrameFit m_fit;
};

bool WebHost::NextEvent(InputEvent& event) {
  PageEvent raw{};
  while (page_next_event(&raw) != 0) {
    event = {};
    event.at = m_fit.FramePoint({raw.x, raw.y});
    if (Translate(raw, event)) return true;
  }
  return false;
}

bool WebHost::Translate(const PageEvent& raw, InputEvent& event) {
  switch (raw.kind) {
    case kPageRoom:
      FillRoom({raw.x, raw.y});
      return false;
    case kPageDown:
      event.kind = InputKind::kPointerDown;
      return true;
    case kPageMove:
      event.kind = InputKind::kPointerMove;
      return true;
    case kPageUp:
      event.kind = InputKind::kPointerUp;
      return true;
    case kPageLeave:
      event.kind = InputKind::kPointerLeave;
      return true;
    case kPageWheel:
      event.kind = InputKind::kWheel;
      event.wheel = raw.wheel;
      return true;
    case kPageKey:
      return TranslateKey(raw, event);
    default:
      event.kind = InputKind::kText;
      event.text = TakeText(page_event_text());
      return true;
  }
}

bool WebHost::TranslateKey(const PageEvent& raw, InputEvent& event) const {
  const std::optional<KeyStroke> stroke = ParseChord(TakeText(page_event_text()));
  if (!stroke || (raw.repeat != 0 && !ActsWhileHeld(stroke->key))) return false;
  event.kind = InputKind::kKey;
  event.stroke = *stroke;
  return true;
}

void WebHost::FillRoom(Size room) {
  m_fit = FrameFit(m_frameSize, room);
  const Rect& place = m_fit.Place();
  page_place(place.left, place.top, place.Width(), place.Height());
}

std::string WebHost::StartHelpViewer(const std::string& commandLine) {
  const std::string page = "help/" + commandLine.substr(commandLine.find(':') + 1);
  if (page_open(page.c_str()) != 0) return {};
  return "The browser does not let the help come up; it lies in " + page + ".";
}

}  // namespace

std::unique_ptr<Host> CreateHost(const HostOptions& options, std::string&) {
  return std::make_unique<WebHost>(options.frameSize);
}

}  // namespace platform
