"""The blackjack table: a quiet drawing on white, under everything that the game lays on it.

The dealer stands at the top, so all arcs have their centre above the picture. The player box
hides (12, 92)-(120, 176) and the advice stands beside it, from (125, 139) down; the dealer's cards
lie from (79, 10), the player's from (79, 217), and those of a split from (19, 217) and (139, 217),
each with a total some pixels to the right of where five cards end, the last one up to (226, 257);
the strategy button stands on the medallion. Nothing is darker than INK_LIMIT allows, so that dark
red and black text keeps its contrast wherever it falls.
"""

import math

import shapes
from lettering import stroke_width, stroked
from pixels import Canvas

WIDTH, HEIGHT = 240, 268
# 255 - 226: the darkest step of the paper ramp.
INK_LIMIT = 29

_ARC_CENTRE = (120, -585)
_TEXT = "BLACKJACK PAYS 3 TO 2"
_TEXT_TOP = 658.5
_TEXT_UNIT = 10 / 6
_TEXT_GAP = 1.9
_TEXT_BLANK = 2.6
_TEXT_STROKE = 0.68

_MEDALLION = (180, 118)
# Radii: the band with the inscription, and the line that ends the player's field.
_BAND_TOP, _PLAYERS_LINE = 650.5, 772
_SUITS = ((135, 118), (150, 118), (210, 118), (225, 118),
          (19, 191), (35, 193), (205, 193), (221, 191))
_SUIT_HALF, _SUIT_INK = 5, 16
_INSIDE_FRAME = 4
# Cards lie in two long trays, alike: the player's may be one hand or two, and their totals lie
# beside them.
_TRAYS = ((10, 6, 230, 55), (10, 213, 230, 262))
_TRAY_INK = 3


class Paper:
    """White paper that takes light ink; laying ink twice keeps the darker of the two."""

    def __init__(self):
        self._ink = [[0.0] * WIDTH for _ in range(HEIGHT)]

    def lay(self, shape, ink, box=(0, 0, WIDTH, HEIGHT)):
        left, top, right, bottom = box
        for y in range(max(0, math.floor(top)), min(HEIGHT, math.ceil(bottom))):
            for x in range(max(0, math.floor(left)), min(WIDTH, math.ceil(right))):
                covered = shapes.coverage(shape, x, y)
                self._ink[y][x] = max(self._ink[y][x], ink * covered)

    def lay_placed(self, shape, x, y, half_height, ink):
        reach = half_height + 1
        box = (x - reach, y - reach, x + reach, y + reach)
        self.lay(shapes.placed(shape, x, y, half_height), ink, box)

    def canvas(self):
        picture = Canvas(WIDTH, HEIGHT)
        for y, row in enumerate(self._ink):
            for x, ink in enumerate(row):
                step = min(INK_LIMIT, round(ink))
                if step:
                    picture.put(x, y, f"paper_{255 - step}")
        return picture


def _arc_radius(x, y):
    return math.hypot(x - _ARC_CENTRE[0], y - _ARC_CENTRE[1])


def _arc(inner, outer):
    """A line across the table, from frame to frame."""
    within_frame = _framed(_INSIDE_FRAME)
    return lambda x, y: inner <= _arc_radius(x, y) < outer and within_frame(x, y)


def _rounded(left, top, right, bottom, radius):
    def inside(x, y):
        dx = max(left + radius - x, x - right + radius, 0)
        dy = max(top + radius - y, y - bottom + radius, 0)
        return math.hypot(dx, dy) < radius
    return inside


def _framed(inset):
    """The whole picture less an inset, with round corners."""
    return _rounded(inset, inset, WIDTH - inset, HEIGHT - inset, 10 - inset)


def _outline(outer, inner):
    return lambda x, y: outer(x, y) and not inner(x, y)


def _lay_inscription(paper):
    widths = [_TEXT_BLANK if letter == " " else stroke_width(letter) for letter in _TEXT]
    place = -(sum(widths) + _TEXT_GAP * (len(_TEXT) - 1)) / 2
    for letter, width in zip(_TEXT, widths):
        if letter != " ":
            _lay_letter(paper, letter, place, width)
        place += width + _TEXT_GAP


def _lay_letter(paper, letter, place, width):
    """Lays one letter on the arc, `place` units along it from the middle of the table."""
    ink = stroked(letter, _TEXT_STROKE)
    middle = _TEXT_TOP + 3 * _TEXT_UNIT

    def on_arc(x, y):
        turn = math.atan2(x - _ARC_CENTRE[0], y - _ARC_CENTRE[1])
        return ink(turn * middle / _TEXT_UNIT - place,
                   (_arc_radius(x, y) - _TEXT_TOP) / _TEXT_UNIT)

    turn = (place + width / 2) * _TEXT_UNIT / middle
    x = _ARC_CENTRE[0] + middle * math.sin(turn)
    y = _ARC_CENTRE[1] + middle * math.cos(turn)
    paper.lay(on_arc, INK_LIMIT, (x - 9, y - 10, x + 9, y + 10))


def _lay_suits(paper):
    """Two suits on either side of the medallion and of the player's field, where
    neither box, advice nor buttons cover one by half."""
    for suit, (x, y) in zip(shapes.SUITS * 2, _SUITS):
        paper.lay_placed(suit, x, y, _SUIT_HALF, _SUIT_INK)


def _lay_medallion(paper):
    x, y = _MEDALLION
    box = (x - 28, y - 28, x + 28, y + 28)
    paper.lay(shapes.ring(x, y, 18.5, 20), INK_LIMIT, box)
    paper.lay(shapes.ring(x, y, 13, 14), INK_LIMIT, box)

    def edge_marks(px, py):
        turn = math.atan2(py - y, px - x) / (2 * math.pi) * 8
        return 14 <= math.hypot(px - x, py - y) < 18.5 and abs(turn - round(turn)) < 0.22

    paper.lay(edge_marks, 16, box)
    paper.lay_placed(shapes.spade, x, y - 0.5, 9, 20)


def _lay_tray(paper, tray):
    left, top, right, bottom = tray
    outer = _rounded(left, top, right, bottom, 5)
    paper.lay(outer, _TRAY_INK, tray)
    inner = _rounded(left + 1, top + 1, right - 1, bottom - 1, 4)
    paper.lay(_outline(outer, inner), INK_LIMIT, tray)


def _lay_frame(paper):
    paper.lay(_outline(_framed(1), _framed(2)), INK_LIMIT)
    paper.lay(_outline(_framed(3), _framed(_INSIDE_FRAME)), 18)


def blackjack_table():
    paper = Paper()
    _lay_suits(paper)
    for offset, width, ink in ((0, 1, 18), (2.5, 1.5, INK_LIMIT),
                               (21.5, 1.5, INK_LIMIT), (24.5, 1, 18)):
        paper.lay(_arc(_BAND_TOP + offset, _BAND_TOP + offset + width), ink)
    for offset, width, ink in ((-2, 1.2, 22), (1, 1, 14)):
        paper.lay(_arc(_PLAYERS_LINE + offset, _PLAYERS_LINE + offset + width), ink)
    _lay_inscription(paper)
    _lay_medallion(paper)
    for tray in _TRAYS:
        _lay_tray(paper, tray)
    _lay_frame(paper)
    return paper.canvas()


def make_all(output_dir):
    blackjack_table().save(output_dir / "130_table.png", 256)
