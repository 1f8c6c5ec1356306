#include "platform/draw/face.h"

#include <freetype/freetype.h>
#include <freetype/ftmodapi.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdlib>
#include <utility>

#include "platform/draw/embedded.h"
#include "platform/draw/font_finder.h"
#include "platform/draw/type_memory.h"

namespace platform {
namespace {

/// The point sizes at which the hinted face is exactly so many pixels high (measured).
struct FaceSize {
  int cellHeight;
  int points;
};
constexpr std::array<FaceSize, 5> kFaceSizes = {{{11, 9}, {13, 11}, {14, 12}, {15, 13}, {22, 19}}};

FaceSize NearestSize(int height) {
  return *std::min_element(kFaceSizes.begin(), kFaceSizes.end(), [height](FaceSize a, FaceSize b) {
    return std::abs(a.cellHeight - height) < std::abs(b.cellHeight - height);
  });
}

/// At this height the bold face looks like the normal one.
constexpr int kNoBoldHeight = 11;

/// The type library counts in parts of a pixel.
constexpr FT_Pos kPartsOfPixel = 64;
int Nearest(FT_Pos parts) { return static_cast<int>((parts + kPartsOfPixel / 2) >> 6); }
int Ceiling(FT_Pos parts) { return static_cast<int>((parts + kPartsOfPixel - 1) >> 6); }
short Short(int pixels) { return static_cast<short>(pixels); }

/// The ink of one row of a bitmap of bits, whose left edge stands so far from the pen.
void AddRow(Glyph& glyph, int y, int left, const unsigned char* bits, int width) {
  const auto isInk = [&](int x) { return x < width && (bits[x / 8] & 0x80 >> x % 8) != 0; };
  for (int x = 0; x < width; ++x) {
    const int begin = x;
    while (isInk(x)) ++x;
    if (x > begin) glyph.Add({Short(y), Short(left + begin), Short(left + x)});
  }
}

}  // namespace

/// A face open at one size. It has a type library of its own, so that all that
/// was taken for it can be given back.
class Face::OpenFace {
 public:
  OpenFace(const char* fileName, int points) {
    const EmbeddedFile* file = FindEmbedded(FontFiles(), fileName);
    if (file == nullptr || !OpenLibrary()) return;
    FT_New_Memory_Face(m_library, file->data, static_cast<FT_Long>(file->size), 0, &m_face);
    SetPoints(points);
  }
  OpenFace(const FontFile& file, int points) {
    if (file.path.empty() || !OpenLibrary()) return;
    FT_New_Face(m_library, file.path.c_str(), file.index, &m_face);
    SetPoints(points);
  }
  /// The library closes its faces itself.
  ~OpenFace() { FT_Done_Library(m_library); }
  OpenFace(const OpenFace&) = delete;
  OpenFace& operator=(const OpenFace&) = delete;

  /// The rows of a cell above the line that letters stand on.
  int Ascent() const {
    if (m_face == nullptr) return 0;
    return Ceiling(FT_MulFix(m_face->ascender, m_face->size->metrics.y_scale));
  }

  /// Without the ink above and below the cell.
  Glyph Draw(char32_t character, int cellHeight, int ascent) const {
    Glyph glyph;
    if (m_face == nullptr) return glyph;
    glyph.number = FT_Get_Char_Index(m_face, character);
    if (FT_Load_Glyph(m_face, glyph.number, FT_LOAD_RENDER | FT_LOAD_TARGET_MONO) != 0) return {};
    const FT_GlyphSlotRec& drawn = *m_face->glyph;
    glyph.advance = Short(Nearest(drawn.advance.x));
    const int top = ascent - drawn.bitmap_top;
    const int last = std::min(static_cast<int>(drawn.bitmap.rows), cellHeight - top);
    for (int row = std::max(0, -top); row < last; ++row) {
      AddRow(glyph, top + row, drawn.bitmap_left,
             drawn.bitmap.buffer + std::ptrdiff_t{row} * drawn.bitmap.pitch,
             static_cast<int>(drawn.bitmap.width));
    }
    return glyph;
  }

  int Kerning(unsigned first, unsigned second) const {
    FT_Vector kerning{};
    if (m_face != nullptr) FT_Get_Kerning(m_face, first, second, FT_KERNING_UNFITTED, &kerning);
    return Nearest(kerning.x);
  }

 private:
  bool OpenLibrary() {
    if (FT_New_Library(static_cast<FT_Memory>(TypeMemory()), &m_library) != 0) return false;
    FT_Add_Default_Modules(m_library);
    return true;
  }
  void SetPoints(int points) {
    if (m_face != nullptr && FT_Set_Char_Size(m_face, 0, points * kPartsOfPixel, 0, 0) != 0) {
      m_face = nullptr;
    }
  }

  FT_Library m_library = nullptr;
  FT_Face m_face = nullptr;
};

Face::Face(int cellHeight, int points, bool bold)
    : m_nCellHeight(cellHeight), m_nPoints(points), m_bBold(bold) {}
Face::~Face() = default;

Face& Face::Of(const Font& font) {
  static std::map<std::pair<int, bool>, Face> faces;
  const auto [height, points] = NearestSize(font.height);
  const bool bold = font.bold && height != kNoBoldHeight;
  return faces.try_emplace({height, bold}, height, points, bold).first->second;
}

Face::OpenFace* Face::Open() {
  if (m_pOpenFace == nullptr) {
    m_pOpenFace = std::make_unique<OpenFace>(
        m_bBold ? "LiberationSans-Bold.ttf" : "LiberationSans-Regular.ttf", m_nPoints);
    CloseIfShort();
  }
  return m_pOpenFace.get();
}

bool Face::CloseIfShort() {
  if (!TypeMemoryWasShort()) return false;
  m_pOpenFace.reset();
  return true;
}

const Glyph& Face::Find(char32_t character) {
  const auto known = m_mapGlyphs.find(character);
  if (known != m_mapGlyphs.end()) return known->second;
  static const Glyph kNone;
  const OpenFace* face = Open();
  if (face == nullptr) return kNone;
  Glyph glyph = face->Draw(character, m_nCellHeight, face->Ascent());
  if (glyph.number == 0) UseSecondFace(character, face->Ascent(), glyph);
  if (CloseIfShort()) return kNone;
  return m_mapGlyphs.emplace(character, std::move(glyph)).first->second;
}

void Face::UseSecondFace(char32_t character, int ascent, Glyph& glyph) const {
  const OpenFace face(FindFontFile(character), m_nPoints);
  Glyph drawn = face.Draw(character, m_nCellHeight, ascent);
  if (drawn.number == 0) return;
  drawn.number = 0;  // no letter of the first face, which knows nothing of how it kerns
  glyph = std::move(drawn);
}

int Face::Kerning(const Glyph& first, const Glyph& second) {
  const OpenFace* face = Open();
  return face == nullptr ? 0 : face->Kerning(first.number, second.number);
}

}  // namespace platform
