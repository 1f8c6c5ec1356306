#include "platform/window/document_template.h"

#include <utility>

namespace platform {

CSingleDocTemplate::CSingleDocTemplate(const std::string& documentString, Makers makers)
    : m_strTitle(documentString.substr(0, documentString.find('\n'))),
      m_makers(std::move(makers)) {}

bool CSingleDocTemplate::OpenNewDocument() {
  if (m_pDocument == nullptr) m_pDocument = m_makers.document();
  if (m_pFrame == nullptr && !BuildFrame()) return false;
  if (!m_pDocument->OnNewDocument()) return false;
  m_pFrame->View().OnInitialUpdate();
  return true;
}

bool CSingleDocTemplate::BuildFrame() {
  auto frame = m_makers.frame(m_strTitle);
  if (frame->OnCreate() != 0) return false;
  frame->SetView(m_makers.view(*frame));
  m_pFrame = std::move(frame);
  return true;
}

}  // namespace platform
