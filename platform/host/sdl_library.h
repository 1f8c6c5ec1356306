#pragma once

#include <SDL_loadso.h>

namespace platform {

/// A library that a desktop may have, loaded only when it is needed.
class SdlLibrary {
 public:
  explicit SdlLibrary(const char* fileName) : m_pLibrary(SDL_LoadObject(fileName)) {}
  ~SdlLibrary() { SDL_UnloadObject(m_pLibrary); }
  SdlLibrary(const SdlLibrary&) = delete;
  SdlLibrary& operator=(const SdlLibrary&) = delete;

  /// Finds one of its functions; null where it is not there.
  template <class Function>
  void Load(Function*& function, const char* name) {
    function = m_pLibrary == nullptr
                   ? nullptr
                   : reinterpret_cast<Function*>(SDL_LoadFunction(m_pLibrary, name));
    m_bComplete = m_bComplete && function != nullptr;
  }
  /// Whether all that was looked for is there.
  bool IsComplete() const { return m_bComplete; }

 private:
  void* m_pLibrary;
  bool m_bComplete = true;
};

}  // namespace platform
