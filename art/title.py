"""The title picture: the name over a table that has a seat free. Hard pixels throughout."""

import math
from pathlib import Path

import cards
import chips
import courts
import nameplate
from pixels import Canvas, read_grids

WIDTH, HEIGHT = 96, 116

# The felt's middle and half axes, and how much wider the rail around it is.
_FELT = (48, 83.5, 40, 21)
_RAIL = 6
_RAIL_DEPTH = 4

_CARD_WIDTH, _CARD_HEIGHT = 34, 44
_LEAN = 4
_SIGNS = read_grids(Path(__file__).resolve().parent / "sources" / "pictures" / "title.txt")


def fill(picture, shape, colour):
    """Fills the pixels whose middle a shape holds; `colour` is a name, or gives it at a point."""
    for y in range(picture.height):
        for x in range(picture.width):
            if shape(x + 0.5, y + 0.5):
                picture.put(x, y, colour(x + 0.5, y + 0.5) if callable(colour) else colour)


def ellipse(x, y, rx, ry):
    return lambda px, py: ((px - x) / rx) ** 2 + ((py - y) / ry) ** 2 < 1


def table(picture):
    x, y, rx, ry = _FELT

    def grown(by, drop=0):
        return ellipse(x, y + drop, rx + by, ry + by)

    for drop in range(_RAIL_DEPTH, 0, -1):
        fill(picture, grown(_RAIL, drop), "wood_0" if drop > 1 else "wood_1")
    fill(picture, grown(_RAIL), lambda px, py: "wood_4" if py > y else "wood_2")
    fill(picture, grown(4), "wood_5")
    fill(picture, grown(3), "wood_3")
    fill(picture, grown(1), "wood_0")
    fill(picture, grown(0), lambda px, py: felt_colour(px - x, py - y + 3))
    fill(picture, lambda px, py: ellipse(x, y, rx - 6, ry - 4.8)(px, py)
         and not ellipse(x, y, rx - 7, ry - 5.8)(px, py), "felt_6")


def felt_colour(dx, dy):
    """A pool of light in the middle of the felt."""
    distance = math.hypot(dx / 40, dy / 22)
    return f"felt_{max(3, min(6, round(7.4 - 4 * distance)))}"


class LeaningCard:
    """A large card that leans by a pixel in so many, to the left (below 0) or to the right.

    Rows and then columns are moved on by whole pixels, so that every edge is an even stair. A sign
    of few pixels would be torn by moved columns: only its rows are moved.
    """

    def __init__(self, lean):
        self._right, self._step = lean > 0, abs(lean)
        self._width = _CARD_WIDTH + (_CARD_HEIGHT - 1) // self._step
        self.canvas = Canvas(self._width, _CARD_HEIGHT + (self._width - 1) // self._step, "nothing")

    def _shift(self, y):
        """How far a row is moved to the right."""
        return (_CARD_HEIGHT - 1 - y if self._right else y) // self._step

    def _place(self, x, y):
        """Where a pixel of the upright card comes to lie."""
        column = x + self._shift(y)
        return column, y + (column if self._right else self._width - 1 - column) // self._step

    def lay(self, flat):
        """Lays an upright card; all but where it is "nothing"."""
        for y in range(flat.height):
            for x in range(flat.width):
                if flat.get(x, y) != "nothing":
                    self.canvas.put(*self._place(x, y), flat.get(x, y))

    def _sign(self, canvas, x, y, name, colour):
        rows = _SIGNS[name]
        _, top = self._place(x + len(rows[0]) // 2, y)
        for step, row in enumerate(rows):
            canvas.text_grid(x + self._shift(y + step), top + step, [row], {"#": colour})

    def sign(self, x, y, name, colour):
        """Sets a sign whose top-left corner is this pixel of the upright card."""
        self._sign(self.canvas, x, y, name, colour)

    def sign_corners(self, letter, suit, colour):
        """Sets a rank and a suit, and the same upside down."""
        corner = Canvas(self.canvas.width, self.canvas.height, "nothing")
        self._sign(corner, 3, 3, letter, colour)
        self._sign(corner, 3, 13, suit, colour)
        self.canvas.blit(corner, 0, 0, "nothing")
        self.canvas.blit(corner.rotated180(), 0, 0, "nothing")


def blank_card():
    card = Canvas(_CARD_WIDTH, _CARD_HEIGHT, "ink")
    card.rect(1, 1, _CARD_WIDTH - 1, _CARD_HEIGHT - 1, "white")
    for x in (0, _CARD_WIDTH - 1):
        for y in (0, _CARD_HEIGHT - 1):
            card.put(x, y, "nothing")
    return card


def ace_of_spades():
    card = LeaningCard(_LEAN)
    card.lay(blank_card())
    card.sign(8, 12, "spade", "ink")
    card.sign_corners("ace letter", "ace suit", "ink")
    return card.canvas


def queen_of_hearts():
    """The game's own queen, who ends in her sleeves some pixels inside the edges."""
    flat, small = blank_card(), cards.new_card()
    courts.draw(small, "hearts", "queen")
    left, top = (flat.width - small.width) // 2, (flat.height - small.height) // 2
    for y in range(2, small.height - 2):
        for x in range(3, small.width - 3):
            if small.get(x, y) != "white":
                flat.put(x + left, y + top, small.get(x, y))
    card = LeaningCard(-_LEAN)
    card.lay(flat)
    card.sign_corners("queen letter", "queen suit", "card_red")
    return card.canvas


def chip_stack(picture, x, y, count, colours):
    shadow, felt = ellipse(x + 13, y + 7, 11, 4.5), ellipse(*_FELT)
    fill(picture, lambda px, py: shadow(px, py) and felt(px, py), "felt_1")
    chips.stack(picture, x, y, count, colours)


def title():
    picture = Canvas(WIDTH, HEIGHT)
    table(picture)
    fill(picture, ellipse(47, 82, 26, 6), "felt_1")
    picture.blit(queen_of_hearts(), 10, 26, "nothing")
    picture.blit(ace_of_spades(), 38, 26, "nothing")
    chip_stack(picture, 12, 88, 4, chips.RED)
    chip_stack(picture, 65, 88, 3, chips.BLUE)
    chip_stack(picture, 39, 94, 1, chips.BLACK)
    nameplate.draw(picture, 4, 2, "felt_0", "brass_3", "felt_7", ("felt_5", "felt_4", "felt_3"))
    return picture


def make_all(output_dir):
    title().save(output_dir / "140_title.png", 256)
