#pragma once

#include <string>

#include "engine/card_hand.h"
#include "platform/draw/resources.h"
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

/// Knows where everything stands on the table, draws it there, and finds what a tap hit. All places
/// are pixels of the view's client area; a card is always 29 × 41.
class CTableLayout {
 public:
  /// The pictures are the caller's and must outlive the layout.
  explicit CTableLayout(platform::CResources& pictures) : m_pPictures(&pictures) {}

  // render/table_layout.cpp: where things stand.

  /// Binds the surface to draw into and the client rectangle to place things in. The surface is the
  /// caller's and must live until Release; the places hold until the next Prepare.
  void Prepare(platform::CSurface& surface, const platform::Rect& client);
  /// Forgets the surface.
  void Release() { m_pDC = nullptr; }

  /// The top-left corner of the card in a slot (0 is the first) of a position. Leaves x and y alone
  /// for a position that holds no cards.
  void GetCardPos(int& x, int& y, int position, int slot) const;
  /// The whole of that card, though the next one may cover most of it; at (0, 0) for a position
  /// that holds no cards.
  platform::Rect CardRect(int position, int slot) const;
  /// The rectangle of a whole fan or row, positions 0..8; empty for any other.
  platform::Rect GetPosRect(int position) const;

  // render/targets.cpp: what a tap can hit. Each rectangle takes the taps on what is drawn there;
  // where the two differ, the second one is where the picture stands. They follow the last Prepare.

  platform::Rect StrategyButtonRect() const;
  platform::Rect InsuranceYesRect() const;
  /// As large as the other answer's, although its picture is smaller.
  platform::Rect InsuranceNoRect() const;
  platform::Rect InsuranceNoPicture() const;
  /// Coarser than the icons, as a stylus is: the two overlap, and a tap there counts for both.
  platform::Rect BetDownRect() const;
  platform::Rect BetDownPicture() const;
  platform::Rect BetUpRect() const;
  platform::Rect BetUpPicture() const;
  /// Of the plain video-poker table.
  platform::Rect DealButtonRect() const;
  /// Of the video-poker picture: a part of it, so that no client area moves it.
  static constexpr platform::Rect kFancyDealButton{70, 180, 155, 215};

  // 1 when the point is on the target, else 0. Before the first Prepare nothing is hit.
  int HitStrategyButton(platform::Point p) const { return Hit(StrategyButtonRect(), p); }
  int HitInsuranceYes(platform::Point p) const { return Hit(InsuranceYesRect(), p); }
  int HitInsuranceNo(platform::Point p) const { return Hit(InsuranceNoRect(), p); }
  int HitBetDown(platform::Point p) const { return Hit(BetDownRect(), p); }
  int HitBetUp(platform::Point p) const { return Hit(BetUpRect(), p); }
  int HitDealButton(platform::Point p) const { return Hit(DealButtonRect(), p); }
  /// The slot of the middle row's card under the point, 0..4; -1 for none, the outermost column on
  /// either side of a card included.
  int HitTestCard(platform::Point p) const;

  // All that follows draws, and needs a Prepare in the same paint.

  // render/drawing_toolkit.cpp: what both games are drawn with.

  /// Nothing for a position or slot of -1 or a picture number outside 1..65.
  void DrawCard(int position, int slot, int bitmapID) const;
  void DrawHand(int position, CCardHand hand) const;
  void DrawCardBack(int position, int slot) const { DrawCard(position, slot, m_nCardBackID); }
  /// A hand's name to the left of its fan, in the surface's text colour.
  void DrawLabel(int position, const std::string& text) const;
  /// A hand's total or message beside or above its fan, dark red. Above the bottom fan it is larger
  /// and always bold.
  void DrawHandText(int position, const std::string& text, bool bold) const;

  // render/blackjack_drawing.cpp: what only the blackjack table shows.

  /// The stake and the wallet in dollars. In a hand the stake's buttons are greyed.
  void DrawPlayerBox(int stake, double wallet, bool handInProgress) const;
  void DrawStrategyButton() const;
  void DrawAdvice(const std::string& text) const;
  /// The mark above the hand of a split that is being played.
  void DrawActiveMarker(int position) const;
  void DrawInsuranceButtons() const;
  /// In the title of the player box, and so drawn after it.
  void DrawVerdictLamp(bool correct) const;

  // render/video_poker_drawing.cpp: what only the plain video-poker table shows.

  void DrawPayTable() const;
  /// Reads "Deal", or "Play" while dealt cards wait for the draw.
  void DrawPlayButton(bool deal) const;
  /// The wallet in whole dollars, above the label of a hand.
  void DrawAmount(int position, int dollars) const;

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
  // render/table_layout.cpp
  /// Whether things have places yet.
  bool IsPrepared() const { return !m_rcTable.IsEmpty(); }
  platform::Point Center() const;
  int RowGap() const;
  int RowWidth() const;
  /// How far from a fan's middle a slot's card begins.
  int AlongFan(int slot) const;
  int AlongSideFan(int slot) const;
  /// The corner of a position's slot; (0, 0) for a position that holds no cards.
  platform::Point CardCorner(int position, int slot) const;

  // render/targets.cpp
  int InsuranceTop() const;
  int BetTop() const;
  int Hit(const platform::Rect& target, platform::Point p) const;

  // render/drawing_toolkit.cpp
  platform::Point HandTextPos(int position, int textHeight) const;
  /// Text without a cell of its own, as whatever lies beneath is to show through. The felt stays
  /// the surface's back colour.
  void TextOnTable(platform::Point at, const std::string& text) const;
  void DrawPicture(const platform::Rect& place, int bitmapID,
                   platform::RasterOp op = platform::RasterOp::kCopy) const;
  void DrawIcon(const platform::Rect& place, int iconID) const;

  // render/blackjack_drawing.cpp
  /// The height of the player box's title in its type, by which the box and all in it is placed.
  static int TitleHeight();
  platform::Rect BoxRect() const;
  /// The top of a line below the box's title: 0 the wallet, 1 the stake, 2 the stake's buttons.
  int BoxLineTop(int line) const;
  void DrawMoneyLine(int line, const std::string& text) const;

  // render/video_poker_drawing.cpp
  void DrawPayRow(int row, int rowHeight, int numberWidth) const;

  platform::CResources* m_pPictures;
};

}  // namespace feltside
