#include "shell/window_memory.h"

#include <array>
#include <optional>

#include "platform/host/host.h"
#include "platform/window/application.h"

namespace feltside {
namespace {

struct Entry {
  const char* name;
  int platform::Rect::*side;
};
constexpr std::array<Entry, 4> kEntries = {{
    {"LEFT", &platform::Rect::left},
    {"TOP", &platform::Rect::top},
    {"RIGHT", &platform::Rect::right},
    {"BOTTOM", &platform::Rect::bottom},
}};
constexpr const char* kMaximized = "MAXIMIZED";

/// The desktops of today end long before this, on either side.
constexpr int kFarthest = 100000;

bool IsSensible(const platform::Rect& rect) {
  const platform::Rect all{-kFarthest, -kFarthest, kFarthest, kFarthest};
  return !rect.IsEmpty() && rect.Intersection(all) == rect;
}

std::optional<platform::WindowPlace> PlaceIn(const platform::CProfileSection& section) {
  platform::WindowPlace place;
  for (const Entry& entry : kEntries) place.rect.*entry.side = section.GetInt(entry.name, 0);
  place.maximized = section.GetInt(kMaximized, 0) == 1;
  return IsSensible(place.rect) ? std::optional(place) : std::nullopt;
}

}  // namespace

void RestoreWindowPlace(const platform::CProfileSection& stored) {
  if (const auto place = PlaceIn(stored)) platform::TheHost().SetWindowPlace(*place);
}

void StoreWindowPlace(const platform::CProfileSection& stored) {
  const auto place = platform::TheHost().GetWindowPlace();
  if (!place || place == PlaceIn(stored)) return;
  platform::TheApp().Profile().Update(kWindowSection, [&place](platform::CProfileSection& section) {
    for (const Entry& entry : kEntries) section.Set(entry.name, place->rect.*entry.side);
    section.Set(kMaximized, place->maximized ? 1 : 0);
  });
}

}  // namespace feltside
