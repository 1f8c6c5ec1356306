#include "platform/draw/text.h"

#include <freetype/freetype.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <map>
#include <vector>

#include "platform/draw/embedded.h"
#include "platform/draw/utf8.h"

namespace platform {
namespace {

/// The point sizes at which the hinted face is exactly so many pixels high (measured).
struct FaceSize {
  int cellHeight;
  int points;
};
constexpr std::array<FaceSize, 5> kFaceSizes = {{{11, 9}, {13, 11}, {14, 12}, {15, 13}, {22, 19}}};

/// At this height the bold face looks like the normal one, so bold is the normal face struck twice.
constexpr int kStruckTwiceHeight = 11;

/// The type library counts in parts of a pixel: from those to whole pixels, down and up.
constexpr FT_Pos kPartsOfPixel = 64;
int Floor(FT_Pos parts) { return static_cast<int>(parts >> 6); }
int Ceiling(FT_Pos parts) { return Floor(parts + kPartsOfPixel - 1); }

std::size_t NearestFace(int height) {
  const auto nearest =
      std::min_element(kFaceSizes.begin(), kFaceSizes.end(), [height](FaceSize a, FaceSize b) {
        return std::abs(a.cellHeight - height) < std::abs(b.cellHeight - height);
      });
  return static_cast<std::size_t>(nearest - kFaceSizes.begin());
}

/// A letter of a face as it was drawn: where its ink stands, seen from the pen on the cell's top.
struct Letter {
  FT_UInt glyph = 0;
  FT_Pos advance = 0;
  int left = 0;
  int right = 0;  ///< where the ink ends
  std::vector<Point> ink;
};

/// A face at one size, which may not have been readable: then its letters are empty.
class Face {
 public:
  Face(FT_Library library, const EmbeddedFile* file, int points) {
    if (file == nullptr || FT_New_Memory_Face(library, file->data, static_cast<FT_Long>(file->size),
                                              0, &m_face) != 0) {
      return;
    }
    FT_Set_Char_Size(m_face, 0, points * kPartsOfPixel, 0, 0);
    m_nAscent = Ceiling(FT_MulFix(m_face->ascender, m_face->size->metrics.y_scale));
  }

  /// Each letter is drawn once.
  const Letter& Find(char32_t character) {
    const auto known = m_mapLetters.find(character);
    return known != m_mapLetters.end()
               ? known->second
               : m_mapLetters.emplace(character, Draw(character)).first->second;
  }

  FT_Pos Kerning(const Letter& first, const Letter& second) const {
    FT_Vector kerning{};
    if (m_face != nullptr) {
      FT_Get_Kerning(m_face, first.glyph, second.glyph, FT_KERNING_UNFITTED, &kerning);
    }
    return kerning.x;
  }

 private:
  Letter Draw(char32_t character) {
    Letter letter;
    if (m_face == nullptr) return letter;
    letter.glyph = FT_Get_Char_Index(m_face, character);
    constexpr FT_Int32 kOneBit = FT_LOAD_RENDER | FT_LOAD_TARGET_MONO;
    if (FT_Load_Glyph(m_face, letter.glyph, kOneBit) != 0) return letter;
    const FT_GlyphSlotRec& drawn = *m_face->glyph;
    letter.advance = drawn.advance.x;
    letter.left = drawn.bitmap_left;
    letter.right = letter.left + static_cast<int>(drawn.bitmap.width);
    for (int y = 0; y < static_cast<int>(drawn.bitmap.rows); ++y) {
      for (int x = 0; x < static_cast<int>(drawn.bitmap.width); ++x) {
        const unsigned eight = drawn.bitmap.buffer[y * drawn.bitmap.pitch + x / 8];
        if ((eight >> (7 - x % 8) & 1U) == 0) continue;
        letter.ink.push_back({letter.left + x, m_nAscent - drawn.bitmap_top + y});
      }
    }
    return letter;
  }

  FT_Face m_face = nullptr;
  int m_nAscent = 0;
  std::map<char32_t, Letter> m_mapLetters;
};

/// The opened faces, each read once at its first use.
class FaceCache {
 public:
  FaceCache() { FT_Init_FreeType(&m_library); }
  /// The library closes its faces itself.
  ~FaceCache() { FT_Done_FreeType(m_library); }
  FaceCache(const FaceCache&) = delete;
  FaceCache& operator=(const FaceCache&) = delete;

  Face& Find(std::size_t size, bool bold) {
    const std::size_t number = size * 2 + (bold ? 1 : 0);
    const auto known = m_mapFaces.find(number);
    if (known != m_mapFaces.end()) return known->second;
    const EmbeddedFile* file =
        FindEmbedded(FontFiles(), bold ? "LiberationSans-Bold.ttf" : "LiberationSans-Regular.ttf");
    return m_mapFaces.emplace(number, Face(m_library, file, kFaceSizes[size].points)).first->second;
  }

 private:
  FT_Library m_library = nullptr;
  std::map<std::size_t, Face> m_mapFaces;
};

/// A face as it is asked for: which opened face, and whether it is struck twice.
struct ChosenFace {
  Face& face;
  int cellHeight;
  bool struckTwice;
};

ChosenFace Choose(const Font& font) {
  static FaceCache cache;
  const std::size_t size = NearestFace(font.height);
  const int height = kFaceSizes[size].cellHeight;
  const bool twice = font.bold && height == kStruckTwiceHeight;
  return {cache.Find(size, font.bold && !twice), height, twice};
}

/// Goes through a text and tells, for each letter, where the pen stands in pixels and where the
/// text goes on in bytes; answers where the pen stands at the end. Ink never begins before 0. A
/// face struck twice has no kerning, and a pixel more for each letter.
template <class LetterRule>
int EachLetter(const ChosenFace& chosen, const std::string& text, LetterRule rule) {
  FT_Pos pen = 0;
  const Letter* previous = nullptr;
  for (std::size_t at = 0, next = 0; at < text.size(); at = next) {
    next = NextLetter(text, at);
    const Letter& letter = chosen.face.Find(CharacterAt(text, at));
    if (previous != nullptr && !chosen.struckTwice) pen += chosen.face.Kerning(*previous, letter);
    if (previous == nullptr || chosen.struckTwice) pen += std::max(0, -letter.left) * kPartsOfPixel;
    rule(letter, Floor(pen), next);
    pen += letter.advance + (chosen.struckTwice ? kPartsOfPixel : 0);
    previous = &letter;
  }
  return Floor(pen);
}

}  // namespace

Size MeasureText(const Font& font, const std::string& text) {
  const ChosenFace chosen = Choose(font);
  int inkEnd = 0;
  const int pen = EachLetter(chosen, text, [&inkEnd](const Letter& letter, int at, std::size_t) {
    inkEnd = at + letter.right;
  });
  return {std::max(pen, inkEnd), chosen.cellHeight};
}

std::size_t FittingLength(const Font& font, const std::string& text, int width) {
  std::size_t fitting = 0;
  EachLetter(Choose(font), text, [&](const Letter& letter, int pen, std::size_t next) {
    if (pen + std::max(Floor(letter.advance), letter.right) <= width) fitting = next;
  });
  return fitting;
}

CBitmap RenderText(const Font& font, const std::string& text) {
  CBitmap stencil = CBitmap::SeeThrough(MeasureText(font, text));
  const ChosenFace chosen = Choose(font);
  const auto strike = [&stencil](Point at) {
    if (stencil.Bounds().Contains(at)) stencil.At(at) = ToPixel(kBlack);
  };
  EachLetter(chosen, text, [&](const Letter& letter, int pen, std::size_t) {
    for (const Point& ink : letter.ink) {
      strike({pen + ink.x, ink.y});
      if (chosen.struckTwice) strike({pen + ink.x + 1, ink.y});
    }
  });
  return stencil;
}

}  // namespace platform
