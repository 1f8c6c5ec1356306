#include "platform/draw/text.h"

#include <algorithm>
#include <array>
#include <vector>

#include "platform/draw/face.h"
#include "platform/draw/utf8.h"

namespace platform {
namespace {

/// A letter where it is set.
struct SetLetter {
  const Glyph* glyph = nullptr;
  int pen = 0;
};

/// Sets a text letter by letter, as the face asks for it but with a pixel clear around the ink of
/// each: at one bit the face's own distances let many letters run together. One letter may still
/// reach over another, as T does over o.
class Setter {
 public:
  Setter(const Font& font, const std::string& text)
      : m_face(Face::Of(font)),
        m_nExtraWeight(font.bold && !m_face.IsBold() ? 1 : 0),
        m_strText(text),
        m_nRows(static_cast<std::size_t>(m_face.CellHeight())) {
    m_arrEnds.fill(-1);
  }

  /// Sets the next letter; false at the end of the text.
  bool Next() {
    if (m_nNext >= m_strText.size()) return false;
    const Glyph& glyph = m_face.Find(CharacterAt(m_strText, m_nNext));
    m_nNext = NextLetter(m_strText, m_nNext);
    int pen = FirstClearPen(glyph);
    if (m_last.glyph != nullptr) {
      const int kerning = m_face.Kerning(*m_last.glyph, glyph);
      pen = std::max(pen, m_last.pen + m_last.glyph->advance + m_nExtraWeight + kerning);
    }
    Add({&glyph, pen});
    return true;
  }

  const SetLetter& Last() const { return m_last; }
  /// Where in the text the next letter begins.
  std::size_t NextAt() const { return m_nNext; }
  /// Of all that is set.
  Size Extent() const { return {m_nWidth, m_face.CellHeight()}; }
  /// The pixels by which ink ends later, and the next letter begins later, than the glyphs say:
  /// letters of a bold text are struck twice where the face has no bold.
  int ExtraWeight() const { return m_nExtraWeight; }

 private:
  /// Where a letter touches nothing that is set, and nothing of it stands before 0.
  int FirstClearPen(const Glyph& glyph) const {
    int pen = 0;
    for (std::size_t row = 0; row < m_nRows; ++row) {
      pen = std::max(pen, m_arrEnds[row] + 1 - glyph.begins[row]);
    }
    return pen;
  }

  void Add(const SetLetter& letter) {
    const int end = letter.pen + m_nExtraWeight;
    for (std::size_t row = 0; row < m_nRows; ++row) {
      m_arrEnds[row] = std::max(m_arrEnds[row], end + letter.glyph->ends[row]);
    }
    m_nWidth = std::max({m_nWidth, end + letter.glyph->advance, end + letter.glyph->right});
    m_last = letter;
  }

  Face& m_face;
  int m_nExtraWeight;
  const std::string& m_strText;
  std::size_t m_nNext = 0;
  SetLetter m_last;
  int m_nWidth = 0;
  std::size_t m_nRows;
  std::array<int, Glyph::kRows> m_arrEnds{};  ///< where the ink of each row ends so far
};

}  // namespace

Size MeasureText(const Font& font, const std::string& text) {
  Setter setter(font, text);
  while (setter.Next()) {
  }
  return setter.Extent();
}

std::size_t FittingLength(const Font& font, const std::string& text, int width) {
  Setter setter(font, text);
  std::size_t fitting = 0;
  while (setter.Next() && setter.Extent().width <= width) fitting = setter.NextAt();
  return fitting;
}

CBitmap RenderText(const Font& font, const std::string& text) {
  std::vector<SetLetter> letters;
  letters.reserve(text.size());
  Setter setter(font, text);
  while (setter.Next()) letters.push_back(setter.Last());
  CBitmap stencil = CBitmap::SeeThrough(setter.Extent());
  for (const SetLetter& letter : letters) {
    for (const auto [y, left, right] : letter.glyph->runs) {
      const int end = letter.pen + right + setter.ExtraWeight();
      for (int x = letter.pen + left; x < end; ++x) {
        stencil.At({x, y}) = ToPixel(kBlack);
      }
    }
  }
  return stencil;
}

}  // namespace platform
