#pragma once

#include "platform/draw/surface.h"

namespace platform {

/// The one look of everything that is not the table: flat, light from the top left.
inline constexpr Color kFaceColor = Rgb(212, 208, 200);
inline constexpr Color kPressedColor = Rgb(184, 180, 172);
inline constexpr Color kLightEdge = kWhite;
inline constexpr Color kShadowEdge = Rgb(128, 128, 128);
inline constexpr Color kDisabledText = Rgb(88, 86, 82);
inline constexpr Color kDisabledSign = Rgb(112, 112, 112);
inline constexpr Color kHighlight = Rgb(10, 36, 106);

/// The type of bars, menus and dialogs.
inline constexpr Font kSystemFont{13, false};

/// A button's face with its edges; pressed, the light comes from below.
void DrawButtonFace(CSurface& surface, const Rect& rect, bool pressed);

/// The cross that closes a window, seven pixels high, in the middle of a button.
void DrawCross(CSurface& surface, const Rect& button);

/// An outline of single dots that shows where the keyboard works.
void DrawFocusRect(CSurface& surface, const Rect& rect);

/// One line of system type whose '&' underlines the letter after it, "&&" being the sign itself.
/// The text's top-left corner is at a place; its background stays.
void DrawMnemonicText(CSurface& surface, Point at, const std::string& text, Color color);

/// A text without its mnemonic signs.
std::string WithoutMnemonic(const std::string& text);

/// The ASCII letter after the single '&' as a capital; '\0' where there is none.
char MnemonicOf(const std::string& text);

/// A picture in the grey of what is disabled, without its white.
CBitmap Greyed(const CBitmap& picture);

}  // namespace platform
