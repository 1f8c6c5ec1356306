#pragma once

#include <string>

#include "engine/card_hand.h"
#include "platform/draw/surface.h"
#include "render/picture_ids.h"

namespace feltside {

/// A fan or row of cards on the table, or a text's place beside one.
enum TablePosition {
  POS_MIDDLE_ROW = 0,    ///< separate cards across the middle: the video-poker hand
  POS_BOTTOM = 1,        ///< a fan: the player's blackjack hand
  POS_TOP = 2,           ///< a fan: the dealer's hand
  POS_LEFT = 3,          ///< a side fan, downwards
  POS_RIGHT = 4,         ///< a side fan, downwards
  POS_BOTTOM_LEFT = 5,   ///< a fan: the first hand after a split
  POS_BOTTOM_RIGHT = 6,  ///< a fan: the second hand after a split
  POS_TOP_LEFT = 7,
  POS_TOP_RIGHT = 8,
  // Texts only:
  POS_ABOVE_BOTTOM = 13,
  POS_ABOVE_BOTTOM_LEFT = 14,
  POS_ABOVE_BOTTOM_RIGHT = 15,
};

/// Of hand totals, messages and advice: a dark red.
inline constexpr platform::Color kMessageColor = platform::Rgb(200, 0, 0);

/// Knows where everything stands on the table, draws it there, and finds what a tap hit by the very
/// same coordinates. All are pixels of the view's client area; a card is always 29 × 41.
class CTableLayout {
 public:
  /// Binds the surface to draw into and the client rectangle to place things in. The surface is the
  /// caller's and must live until Release.
  void Prepare(platform::CSurface& surface, const platform::Rect& client);

  /// Forgets the surface.
  void Release() { m_pDC = nullptr; }

  /// The top-left corner of the card in a slot (0 is the first) of a position. Leaves x and y alone
  /// for a position that holds no cards.
  void GetCardPos(int& x, int& y, int position, int slot) const;
  /// The rectangle of a whole fan or row, positions 0..8; empty for any other.
  platform::Rect GetPosRect(int position) const;

  // Drawing. Prepare must have been called in the same paint.

  /// Nothing for a position or slot of -1 or a picture number outside 1..65.
  void DrawCard(int position, int slot, int bitmapID) const;
  void DrawHand(int position, CCardHand hand) const;
  void DrawCardBack(int position, int slot) const { DrawCard(position, slot, m_nCardBackID); }
  /// A hand's name to the left of its fan.
  void DrawLabel(int position, const std::string& text) const;
  /// A hand's total or message beside or above its fan, dark red.
  void DrawHandText(int position, const std::string& text, bool bold) const;

  void DrawPlayerBox(int stake, double wallet, bool handInProgress) const;
  void DrawStrategyButton() const;
  void DrawAdvice(const std::string& text) const;
  /// The mark above the hand of a split that is being played.
  void DrawActiveMarker(int position) const;
  void DrawInsuranceButtons() const;
  void DrawVerdictLamp(bool correct) const;

  void DrawPayTable() const;
  void DrawPlayButton(bool deal) const;
  void DrawAmount(int position, int dollars) const;

  // Hit tests: 1 when the point is on the target, else 0.

  int HitStrategyButton(platform::Point p) const;
  int HitInsuranceYes(platform::Point p) const;
  int HitInsuranceNo(platform::Point p) const;
  int HitBetDown(platform::Point p) const;
  int HitBetUp(platform::Point p) const;
  int HitDealButton(platform::Point p) const;
  /// The slot of the middle row's card under the point, 0..4; -1 for none.
  int HitTestCard(platform::Point p) const;

  platform::CSurface* m_pDC = nullptr;  ///< from Prepare to Release
  platform::Rect m_rcTable;             ///< the client rectangle; empty before the first Prepare
  platform::Color m_crTable = platform::kWhite;  ///< the felt
  platform::Color m_crBox = platform::kWhite;    ///< the player box
  int m_nCardBackID = kFirstCardBackID;          ///< 54..65
  int m_nRowCards = 0;                           ///< cards that the middle row is centred for
  int m_nFanCards = 5;                           ///< cards that every fan is centred for
  int m_nCardHeight = 41;
  int m_nCardWidth = 29;
  int m_nFanStepX = 0;  ///< between the cards of a fan
  int m_nFanStepY = 0;  ///< between the cards of a side fan

 private:
  platform::Point Center() const;
  int RowGap() const;
  int RowWidth() const;
  /// How far from a fan's middle a slot's card begins.
  int AlongFan(int slot) const;
  int AlongSideFan(int slot) const;
  /// The corner of a position's slot.
  platform::Point CardCorner(int position, int slot) const;
  /// The height of the player box's title in its type; box and stake buttons are placed by it.
  int TitleHeight() const;
  platform::Rect BoxRect(int titleHeight) const;
  platform::Rect PlayButtonRect() const;
  void CopyPicture(platform::Point at, platform::Size size, int bitmapID,
                   platform::RasterOp op = platform::RasterOp::kCopy) const;
  void DrawMoneyLine(int top, int titleHeight, const std::string& text) const;
  void DrawPayRow(int row, int rowHeight, int numberWidth) const;
  platform::Point HandTextPos(int position, int textHeight) const;
  /// Text without a cell of its own, as whatever lies beneath is to show through.
  void TextOnTable(platform::Point at, const std::string& text) const;
  /// The top of both stake buttons' tap areas.
  int StakeTop() const;
};

}  // namespace feltside
