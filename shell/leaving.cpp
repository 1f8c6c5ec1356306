// Leaving the table by the Exit command.

#include "platform/application.h"
#include "table/feltside_view.h"

namespace feltside {

void CFeltsideView::OnExit() {
  platform::TheApp().Queue().PostQuit(0);
}

}  // namespace feltside
