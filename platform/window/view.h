#pragma once

#include "platform/window/command.h"
#include "platform/window/narrator.h"
#include "platform/window/window.h"

namespace platform {

/// The part of the frame below the command bar that shows the document and takes its input.
class CView : public CWindow, public CCommandTarget {
 public:
  using CWindow::CWindow;

  /// The view is shown for the first time with its document, or the document was renewed.
  virtual void OnInitialUpdate() { Invalidate(); }
  /// What it shows, as CTopWindow::Words.
  virtual Phrases Words() const = 0;
  /// Paints the whole client area.
  virtual void OnDraw(CSurface& surface) = 0;

  void OnPaint(CSurface& surface) override { OnDraw(surface); }
};

}  // namespace platform
