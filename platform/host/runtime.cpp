#include "platform/host/runtime.h"

#include <cstdlib>

#include "platform/host/host.h"

namespace platform {

LocalTime GetLocalTime() { return TheHost().Now(); }

void SeedRandom(unsigned seed) { std::srand(seed); }

int NextRandom() { return std::rand(); }

}  // namespace platform
