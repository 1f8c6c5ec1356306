#include "shell/about_dlg.h"

#include "shell/res/dialog_templates.h"

namespace feltside {

CAboutDlg::CAboutDlg() : CDialog(AboutTemplate()) {}

}  // namespace feltside
