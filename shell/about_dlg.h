#pragma once

#include "platform/dialog/dialog.h"

namespace feltside {

/// The title picture and the version. Enter, Escape and the cross close it.
class CAboutDlg : public platform::CDialog {
 public:
  CAboutDlg();
};

}  // namespace feltside
