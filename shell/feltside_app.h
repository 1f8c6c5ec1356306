#pragma once

#include "platform/application.h"

namespace feltside {

/// The program: starts it, ends it, and has the commands that belong to no window.
class CFeltsideApp : public platform::CApplication {
 public:
  CFeltsideApp();

  platform::CommandState QueryCommand(int commandID) const override;
  void RunCommand(int commandID) override;

 protected:
  bool InitInstance() override;

 private:
  struct Commands;

  void OnNew();
};

}  // namespace feltside
