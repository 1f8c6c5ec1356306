#include "platform/runtime.h"

#include <cstdlib>

#include "platform/application.h"
#include "platform/host.h"

namespace platform {

LocalTime GetLocalTime() { return TheHost().Now(); }

void SeedRandom(unsigned seed) { std::srand(seed); }

int NextRandom() { return std::rand(); }

void Sleep(int milliseconds) { TheApp().Queue().Pause(milliseconds); }

}  // namespace platform
