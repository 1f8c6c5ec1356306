#pragma once

#include <map>
#include <optional>
#include <string>

#include "platform/draw/bitmap.h"
#include "platform/draw/embedded.h"

namespace platform {

/// The pictures built into the program, by number: files named "NNN_subject.png" are bitmaps, files
/// named "icon_NNN_subject.png" icons. Each is decoded when it is asked for, and the last ones are
/// kept: a frame shows few of a deck's cards.
class CResources {
 public:
  explicit CResources(EmbeddedFiles files) : m_files(files) {}

  /// The bitmap of that number, which lives until the next one is loaded or all are forgotten.
  /// Where there is none, or it cannot be decoded: a framed blank of the given size that bears the
  /// number.
  const CBitmap& LoadBitmap(int resourceID, Size blank);
  /// The same for who keeps it: decoded for this call alone.
  CBitmap ReadBitmap(int resourceID, Size blank) const;
  /// The icon of that number, with the same rule.
  const CBitmap& LoadIcon(int resourceID, Size blank);
  /// The picture of an icon that comes in several sizes, by its width in pixels; nothing where it
  /// does not come in that size.
  std::optional<CBitmap> LoadIconOfSize(int resourceID, int width) const;
  /// Keeps none of them any longer: makes room for a while in which they are not painted.
  void Forget() { m_mapLoaded.clear(); }

 private:
  const CBitmap& Load(const std::string& kind, int resourceID, Size blank);
  CBitmap Read(const std::string& prefix, int resourceID, Size blank) const;

  EmbeddedFiles m_files;
  std::map<std::string, CBitmap> m_mapLoaded;
};

/// The picture in a PNG file, whatever its colour type; nothing where it cannot be read.
std::optional<CBitmap> DecodePicture(const EmbeddedFile& file);

/// Writes a bitmap as a PNG file; returns whether it was written.
bool SavePng(const CBitmap& bitmap, const std::string& path);

}  // namespace platform
