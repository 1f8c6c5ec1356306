#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>

#include "platform/draw/bitmap.h"
#include "platform/host/input.h"
#include "platform/host/runtime.h"
#include "platform/host/window_place.h"

namespace platform {

/// The one door to the machine: all that the layer needs of it. A port writes one of these.
class Host {
 public:
  Host() = default;
  virtual ~Host() = default;
  Host(const Host&) = delete;
  Host& operator=(const Host&) = delete;

  /// Puts a whole picture of the program's window, always of the same size, before the person. It
  /// must live until the next one is shown: it may be looked at again, and is not kept twice.
  virtual void Show(const CBitmap& frame) = 0;
  /// Names the window and gives it an icon, where there is one.
  virtual void SetIdentity(const std::string& title, const std::optional<CBitmap>& icon) = 0;
  /// Where the window is to open, said before the first picture. A place that is not on the desktop
  /// any more is moved there.
  virtual void SetWindowPlace(const WindowPlace& place) = 0;
  /// Where the person has put the window; nothing where they have not, or where it cannot be put.
  virtual std::optional<WindowPlace> GetWindowPlace() = 0;

  /// Takes the oldest input that has come, without waiting. False: there is none.
  virtual bool NextEvent(InputEvent& event) = 0;
  /// Returns when input may have come, or after so many milliseconds; below 0: however long it
  /// takes.
  virtual void WaitEvent(int milliseconds) = 0;

  /// A steady clock, in milliseconds.
  virtual std::int64_t Ticks() = 0;
  virtual LocalTime Now() = 0;

  /// Says that typed text is wanted, and in which pixels of the window it stands: the list of an
  /// input method, or the keyboard of a device without one, leaves them in sight. Nothing: no text
  /// is wanted.
  virtual void SetTextInput(const std::optional<Rect>& place) = 0;
  virtual std::string GetClipboard() = 0;
  virtual void SetClipboard(const std::string& text) = 0;

  /// Whether what is said may be heard; where not, nothing is put into words.
  virtual bool HasVoice() const = 0;
  /// Has a short text of whole sentences read out, which tells what is new in the window.
  virtual void Say(const std::string& text) = 0;

  /// Starts the help viewer with a command line such as "file:page.htm#topic", beside the program.
  /// Returns what is known to have kept it from coming up, in a sentence for the person that names
  /// the page's place; empty where nothing is known to.
  virtual std::string StartHelpViewer(const std::string& commandLine) = 0;
  /// The folder that keeps programs' settings; it need not exist yet. Empty where the machine has
  /// none.
  virtual std::filesystem::path ProfileFolder() = 0;
};

/// The host of this process. SetHost comes before anything else of the layer; the host stays its
/// owner's and must outlive the program.
void SetHost(Host* host);
Host& TheHost();

}  // namespace platform
