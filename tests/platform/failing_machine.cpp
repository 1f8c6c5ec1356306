// These stand in place of the library's functions.

#include "tests/platform/failing_machine.h"

#include <cstdlib>
#include <new>

using namespace feltside::tests;

void* operator new(std::size_t size) {
  const bool fails = g_nAllocationsLeft > 0 && --g_nAllocationsLeft == 0;
  void* const memory = fails ? nullptr : std::malloc(size);
  if (memory == nullptr) throw std::bad_alloc();
  return memory;
}
void* operator new(std::size_t size, const std::nothrow_t&) noexcept {
  if (g_nBeforeRefusal == 0) {
    if (g_bRefusesOnce) g_nBeforeRefusal = -1;
    return nullptr;
  }
  if (g_nBeforeRefusal > 0) --g_nBeforeRefusal;
  return std::malloc(size);
}
void operator delete(void* memory) noexcept { std::free(memory); }
void operator delete(void* memory, std::size_t) noexcept { std::free(memory); }
