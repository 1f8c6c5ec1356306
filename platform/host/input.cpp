#include "platform/host/input.h"

#include <array>
#include <cctype>
#include <string_view>

namespace platform {
namespace {

struct NamedKey {
  std::string_view name;
  Key key;
};

constexpr std::array kNamedKeys = {
    NamedKey{"Enter", Key::kEnter},   NamedKey{"Escape", Key::kEscape},
    NamedKey{"Tab", Key::kTab},       NamedKey{"Backspace", Key::kBackspace},
    NamedKey{"Delete", Key::kDelete}, NamedKey{"Insert", Key::kInsert},
    NamedKey{"Up", Key::kUp},         NamedKey{"Down", Key::kDown},
    NamedKey{"Left", Key::kLeft},     NamedKey{"Right", Key::kRight},
    NamedKey{"Home", Key::kHome},     NamedKey{"End", Key::kEnd},
    NamedKey{"PageUp", Key::kPageUp}, NamedKey{"PageDown", Key::kPageDown},
    NamedKey{"F1", Key::kF1},         NamedKey{"F4", Key::kF4},
    NamedKey{"F10", Key::kF10},
};

bool TakePrefix(std::string_view& text, std::string_view prefix) {
  if (text.size() <= prefix.size() || text.substr(0, prefix.size()) != prefix) return false;
  text.remove_prefix(prefix.size());
  return true;
}

}  // namespace

std::optional<KeyStroke> ParseChord(const std::string& text) {
  std::string_view rest = text;
  KeyStroke stroke;
  for (bool more = true; more;) {
    more = false;
    if (TakePrefix(rest, "Ctrl+")) more = stroke.ctrl = true;
    if (TakePrefix(rest, "Alt+")) more = stroke.alt = true;
    if (TakePrefix(rest, "Shift+")) more = stroke.shift = true;
  }
  for (const NamedKey& named : kNamedKeys) {
    if (rest == named.name) {
      stroke.key = named.key;
      return stroke;
    }
  }
  if (rest == "Space") rest = " ";
  if (rest.size() != 1 || std::isprint(static_cast<unsigned char>(rest[0])) == 0) {
    return std::nullopt;
  }
  stroke.key = Key::kCharacter;
  stroke.character = static_cast<char>(std::toupper(static_cast<unsigned char>(rest[0])));
  return stroke;
}

std::string ChordText(const KeyStroke& stroke) {
  std::string text;
  if (stroke.ctrl) text += "Ctrl+";
  if (stroke.alt) text += "Alt+";
  if (stroke.shift) text += "Shift+";
  for (const NamedKey& named : kNamedKeys) {
    if (named.key == stroke.key) return text.append(named.name);
  }
  return stroke.character == ' ' ? text + "Space" : text + stroke.character;
}

bool ActsWhileHeld(Key key) {
  switch (key) {
    case Key::kTab:
    case Key::kBackspace:
    case Key::kDelete:
    case Key::kUp:
    case Key::kDown:
    case Key::kLeft:
    case Key::kRight:
    case Key::kPageUp:
    case Key::kPageDown:
      return true;
    default:
      return false;
  }
}

}  // namespace platform
