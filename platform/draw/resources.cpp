#include "platform/draw/resources.h"

#include <cstdio>
#include <utility>

#include "platform/draw/look.h"

namespace platform {
namespace {

/// Enough for every frame of both games.
constexpr std::size_t kMostKept = 24;

std::string FilePrefix(const std::string& kind, int resourceID) {
  char number[16];
  std::snprintf(number, sizeof number, "%03d_", resourceID);
  return kind + number;
}

bool StartsWith(std::string_view text, std::string_view prefix) {
  return text.substr(0, prefix.size()) == prefix;
}

CBitmap Blank(Size size, int resourceID) {
  CBitmap blank(size);
  CSurface surface(blank);
  surface.Rectangle(surface.Bounds());
  surface.SetFont({11, false});
  surface.DrawText(surface.Bounds().Moved({0, size.height / 2 - 5}), std::to_string(resourceID),
                   TextAlign::kCenter);
  return blank;
}

}  // namespace

const CBitmap& CResources::LoadBitmap(int resourceID, Size blank) {
  return Load("", resourceID, blank);
}

const CBitmap& CResources::LoadIcon(int resourceID, Size blank) {
  return Load("icon_", resourceID, blank);
}

CBitmap CResources::ReadBitmap(int resourceID, Size blank) const {
  return Read(FilePrefix("", resourceID), resourceID, blank);
}

const CBitmap& CResources::Load(const std::string& kind, int resourceID, Size blank) {
  const std::string prefix = FilePrefix(kind, resourceID);
  const auto loaded = m_mapLoaded.find(prefix);
  if (loaded != m_mapLoaded.end()) return loaded->second;
  if (m_mapLoaded.size() == kMostKept) m_mapLoaded.clear();
  return m_mapLoaded.emplace(prefix, Read(prefix, resourceID, blank)).first->second;
}

CBitmap CResources::Read(const std::string& prefix, int resourceID, Size blank) const {
  for (const EmbeddedFile& file : m_files) {
    if (!StartsWith(file.name, prefix)) continue;
    if (std::optional<CBitmap> picture = DecodePicture(file)) return std::move(*picture);
    break;
  }
  return Blank(blank, resourceID);
}

std::optional<CBitmap> CResources::LoadIconOfSize(int resourceID, int width) const {
  for (const EmbeddedFile& file : m_files) {
    const std::string name = FilePrefix("icon_", resourceID) + std::to_string(width) + ".png";
    if (file.name == name) return DecodePicture(file);
  }
  return std::nullopt;
}

}  // namespace platform
