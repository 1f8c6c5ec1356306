#include "platform/draw/type_memory.h"

#include <freetype/freetype.h>
#include <freetype/ftmodapi.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <functional>
#include <new>
#include <utility>

namespace platform {
namespace {

class CheckedMemory {
 public:
  FT_Memory Handle() { return &m_record; }
  bool WasShort() { return std::exchange(m_bShort, false); }

 private:
  static void* Allocate(FT_Memory memory, long size) {
    void* block = ::operator new(static_cast<std::size_t>(size), std::nothrow);
    return block != nullptr ? block : From(memory).TakeReserve(static_cast<std::size_t>(size));
  }
  static void Free(FT_Memory memory, void* block) {
    if (!From(memory).GiveBack(block)) ::operator delete(block);
  }
  static void* Reallocate(FT_Memory memory, long oldSize, long newSize, void* block) {
    void* moved = Allocate(memory, newSize);
    if (moved == nullptr) return nullptr;
    std::copy_n(static_cast<char*>(block), std::min(oldSize, newSize), static_cast<char*>(moved));
    Free(memory, block);
    return moved;
  }
  static CheckedMemory& From(FT_Memory memory) {
    return *static_cast<CheckedMemory*>(memory->user);
  }

  void* TakeReserve(std::size_t size) {
    constexpr std::size_t kAlign = alignof(std::max_align_t);
    m_bShort = true;
    if (size > m_arrReserve.size() - m_nTaken) return nullptr;
    ++m_nBlocks;
    return &m_arrReserve[std::exchange(m_nTaken, m_nTaken + (size + kAlign - 1) / kAlign * kAlign)];
  }
  bool GiveBack(void* block) {
    const std::less<const void*> before;
    const char* end = m_arrReserve.data() + m_arrReserve.size();
    if (before(block, m_arrReserve.data()) || !before(block, end)) return false;
    if (--m_nBlocks == 0) m_nTaken = 0;
    return true;
  }

  FT_MemoryRec_ m_record{this, Allocate, Free, Reallocate};
  bool m_bShort = false;
  int m_nBlocks = 0;
  std::size_t m_nTaken = 0;
  alignas(std::max_align_t) std::array<char, 8192> m_arrReserve{};
};

CheckedMemory& Memory() {
  static CheckedMemory memory;
  return memory;
}

}  // namespace

void* TypeMemory() { return Memory().Handle(); }

bool TypeMemoryWasShort() { return Memory().WasShort(); }

}  // namespace platform
