#include "platform/host/host.h"

#include <cstdlib>

namespace platform {
namespace {
Host* g_pHost = nullptr;
}  // namespace

void SetHost(Host* host) { g_pHost = host; }

Host& TheHost() {
  if (g_pHost == nullptr) std::abort();
  return *g_pHost;
}

}  // namespace platform
