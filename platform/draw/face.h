#pragma once

#include <map>
#include <memory>

#include "platform/draw/glyph.h"
#include "platform/draw/text.h"

namespace platform {

/// One face of the type family at one size. What cannot be had of it for want of memory is empty,
/// and had when it is next asked for.
class Face {
 public:
  /// The face that a font is set in. It lives as long as the process.
  static Face& Of(const Font& font);
  Face(int cellHeight, int points, bool bold);
  ~Face();
  Face(const Face&) = delete;
  Face& operator=(const Face&) = delete;

  int CellHeight() const { return m_nCellHeight; }
  bool IsBold() const { return m_bBold; }
  /// Drawn at its first use and kept. A character that the face lacks is taken from a face that the
  /// machine has for it; a box where it has none.
  const Glyph& Find(char32_t character);
  /// By how many pixels, most often below 0, two letters stand farther apart than their advance.
  int Kerning(const Glyph& first, const Glyph& second);

 private:
  class OpenFace;

  /// Null where memory does not suffice.
  OpenFace* Open();
  /// Whether memory has been short since this was last asked; then the face is closed, as the type
  /// library may have done without what it was refused.
  bool CloseIfShort();

  void UseSecondFace(char32_t character, int ascent, Glyph& glyph) const;

  int m_nCellHeight;
  int m_nPoints;
  bool m_bBold;
  std::unique_ptr<OpenFace> m_pOpenFace;
  std::map<char32_t, Glyph> m_mapGlyphs;
};

}  // namespace platform
