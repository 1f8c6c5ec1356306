#pragma once

#include <string>
#include <vector>

#include "platform/draw/geometry.h"

namespace platform {

enum class ControlKind {
  kStatic,    ///< text that does nothing
  kPatch,     ///< a bordered static, which may be all of one colour
  kPicture,   ///< a bitmap resource, whose number stands in `resourceID`
  kGroupBox,  ///< a frame around other controls
  kPushButton,
  kDefaultButton,  ///< the push button that Enter means
  kCheckBox,
  kComboBox,   ///< a drop-down list without typing
  kEdit,       ///< one line of text
  kNumberBox,  ///< a read-only, right-aligned line
  kUpDown,     ///< keeps a number and writes it into the box before it in the template; never shown
  kSlider,     ///< vertical
};

/// A rectangle in dialog units: a quarter of the system type's average width across, an eighth of
/// its height down.
struct UnitRect {
  int x;
  int y;
  int width;
  int height;
};

struct ControlTemplate {
  ControlKind kind;
  int controlID;
  std::string text;
  UnitRect place;
  std::vector<std::string> items = {};  ///< of a combo box
  bool centered = false;                ///< of a static
  int resourceID = 0;                   ///< of a picture
  bool plainText = false;  ///< '&' is only a sign, and what is too long ends in an ellipsis
};

/// What a dialog consists of. Controls are listed in tab order.
struct DialogTemplate {
  std::string title;
  int width;   ///< of the client area, in dialog units
  int height;  ///< likewise
  std::vector<ControlTemplate> controls;
};

/// Controls that nobody asks for by number.
inline constexpr int kNoControlID = -1;

/// Dialog units to pixels, rounded as the platform rounds them.
constexpr int UnitsAcross(int units) { return (units * 6 + 2) / 4; }
constexpr int UnitsDown(int units) { return (units * 13 + 4) / 8; }
constexpr Rect ToPixels(const UnitRect& u) {
  return {UnitsAcross(u.x), UnitsDown(u.y), UnitsAcross(u.x + u.width), UnitsDown(u.y + u.height)};
}

}  // namespace platform
