#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "platform/window/frame_window.h"

namespace platform {

/// What a program's one document holds. A new document starts empty.
class CDocument {
 public:
  virtual ~CDocument() = default;
  /// Empties the document; false when that fails.
  virtual bool OnNewDocument() { return true; }
};

/// Ties the document, the frame and the view of a program together: it builds the three when the
/// first document is opened, and uses the same three again for every later one.
class CSingleDocTemplate {
 public:
  /// What the three are made by.
  struct Makers {
    std::function<std::unique_ptr<CDocument>()> document;
    std::function<std::unique_ptr<CFrameWindow>(const std::string& title)> frame;
    std::function<std::unique_ptr<CView>(CFrameWindow&)> view;
  };

  /// The document string has seven fields separated by line ends, the window title first.
  CSingleDocTemplate(const std::string& documentString, Makers makers);

  /// Opens an empty document and gives the view its initial update; false when a part of it could
  /// not be made.
  bool OpenNewDocument();

  /// Null before the first document.
  CFrameWindow* Frame() const { return m_pFrame.get(); }

 private:
  bool BuildFrame();

  std::string m_strTitle;
  Makers m_makers;
  std::unique_ptr<CDocument> m_pDocument;
  std::unique_ptr<CFrameWindow> m_pFrame;
};

}  // namespace platform
