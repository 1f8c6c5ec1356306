#pragma once

#include <deque>
#include <functional>
#include <string>
#include <vector>

#include "platform/host/host.h"

namespace platform {

/// A host without a machine: no display, input that is put in by hand, a clock that stands still
/// until it is told to move (waiting moves it), the shown pictures kept for the asking.
class OffscreenHost : public Host {
 public:
  explicit OffscreenHost(std::filesystem::path profileFolder)
      : m_profileFolder(std::move(profileFolder)) {}

  void PutInput(const InputEvent& event) { m_arrInput.push_back(event); }
  void SetClock(const LocalTime& now);
  /// Called when the program waits for input and there is none, again and again until it has put
  /// some in. Once it returns false, and without a handler, the window is closed.
  void SetIdleHandler(std::function<bool()> onIdle) { m_fnOnIdle = std::move(onIdle); }

  const CBitmap& Shown() const { return m_shown; }
  const std::vector<std::string>& HelpCalls() const { return m_arrHelpCalls; }
  /// Where text is wanted; nothing where none is.
  const std::optional<Rect>& TextPlace() const { return m_rcText; }
  /// What was said last; empty before anything was.
  const std::string& Said() const { return m_strSaid; }

  void Show(const CBitmap& frame) override { m_shown = frame; }
  void SetIdentity(const std::string&, const std::optional<CBitmap>&) override {}
  void SetWindowPlace(const WindowPlace& place) override { m_windowPlace = place; }
  std::optional<WindowPlace> GetWindowPlace() override { return m_windowPlace; }
  bool NextEvent(InputEvent& event) override;
  void WaitEvent(int milliseconds) override;
  std::int64_t Ticks() override { return m_nTicks; }
  LocalTime Now() override;
  void SetTextInput(const std::optional<Rect>& place) override { m_rcText = place; }
  std::string GetClipboard() override { return m_strClipboard; }
  void SetClipboard(const std::string& text) override { m_strClipboard = text; }
  bool HasVoice() const override { return true; }
  void Say(const std::string& text) override { m_strSaid = text; }
  std::string StartHelpViewer(const std::string& commandLine) override {
    m_arrHelpCalls.push_back(commandLine);
    return {};
  }
  std::filesystem::path ProfileFolder() override { return m_profileFolder; }

 private:
  std::filesystem::path m_profileFolder;
  std::deque<InputEvent> m_arrInput;
  std::function<bool()> m_fnOnIdle;
  std::int64_t m_nTicks = 0;
  LocalTime m_clock{2000, 1, 1, 12, 0, 0};  ///< what the clock showed when it was last set
  std::int64_t m_nClockSetAt = 0;           ///< the ticks then
  CBitmap m_shown;
  std::string m_strClipboard;
  std::string m_strSaid;
  std::vector<std::string> m_arrHelpCalls;
  std::optional<Rect> m_rcText;
  std::optional<WindowPlace> m_windowPlace;
};

}  // namespace platform
