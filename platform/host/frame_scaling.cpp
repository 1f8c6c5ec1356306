#include "platform/host/frame_scaling.h"

#include <algorithm>
#include <cstddef>

namespace platform {
namespace {

using Row = std::vector<Pixel>;

/// Adds pixels up by their shares.
class Mixture {
 public:
  void Add(Pixel pixel, unsigned share) {
    m_nRed += (pixel >> 16 & 0xFF) * share;
    m_nGreen += (pixel >> 8 & 0xFF) * share;
    m_nBlue += (pixel & 0xFF) * share;
  }
  /// The mixture of so many shares in all.
  Pixel Of(unsigned shares) const {
    const auto part = [shares](unsigned sum) { return (sum + shares / 2) / shares; };
    return 0xFF000000U | part(m_nRed) << 16 | part(m_nGreen) << 8 | part(m_nBlue);
  }

 private:
  unsigned m_nRed = 0;
  unsigned m_nGreen = 0;
  unsigned m_nBlue = 0;
};

/// Which of a line of source cells lie under one of a line of target cells of the same length.
class Cover {
 public:
  Cover(int target, int targets, int sources)
      : m_nBegin(target * sources), m_nEnd(m_nBegin + sources), m_nUnit(targets) {}

  int First() const { return m_nBegin / m_nUnit; }
  int Last() const { return (m_nEnd - 1) / m_nUnit; }
  unsigned Shares() const { return static_cast<unsigned>(m_nEnd - m_nBegin); }
  /// How many of all shares of the target cell a source cell has.
  unsigned ShareOf(int source) const {
    return static_cast<unsigned>(std::min(m_nEnd, (source + 1) * m_nUnit) -
                                 std::max(m_nBegin, source * m_nUnit));
  }

 private:
  // Lengths of which a source cell has m_nUnit.
  int m_nBegin;
  int m_nEnd;
  int m_nUnit;
};

/// A row of the picture scaled in width.
class WideRow {
 public:
  WideRow(const CBitmap& frame, int width) : m_frame(frame) {
    for (int x = 0; x < width; ++x) m_arrCovers.emplace_back(x, width, frame.GetSize().width);
  }

  /// The last one is kept, as neighbouring rows of the target often need the same.
  const Row& At(int y) {
    if (y != m_nY) Make(y);
    return m_arrRow;
  }

 private:
  void Make(int y) {
    m_nY = y;
    m_arrRow.clear();
    for (const Cover& cover : m_arrCovers) {
      const Pixel first = m_frame.At({cover.First(), y});
      m_arrRow.push_back(cover.First() == cover.Last() ? first : Mixed(cover, y));
    }
  }

  Pixel Mixed(const Cover& cover, int y) const {
    Mixture mixture;
    for (int x = cover.First(); x <= cover.Last(); ++x) {
      mixture.Add(m_frame.At({x, y}), cover.ShareOf(x));
    }
    return mixture.Of(cover.Shares());
  }

  const CBitmap& m_frame;
  std::vector<Cover> m_arrCovers;
  int m_nY = -1;
  Row m_arrRow;
};

Row MixedRow(WideRow& source, const Cover& cover, int width) {
  std::vector<Mixture> mixtures(static_cast<std::size_t>(width));
  for (int y = cover.First(); y <= cover.Last(); ++y) {
    const Row& row = source.At(y);
    for (std::size_t x = 0; x < row.size(); ++x) mixtures[x].Add(row[x], cover.ShareOf(y));
  }
  Row mixed;
  for (const Mixture& mixture : mixtures) mixed.push_back(mixture.Of(cover.Shares()));
  return mixed;
}

}  // namespace

void ScaleFrame(const CBitmap& frame, Size size, const RowSink& sink) {
  WideRow source(frame, size.width);
  for (int y = 0; y < size.height; ++y) {
    const Cover cover(y, size.height, frame.GetSize().height);
    if (cover.First() == cover.Last()) {
      sink(y, source.At(cover.First()));
    } else {
      sink(y, MixedRow(source, cover, size.width));
    }
  }
}

}  // namespace platform
