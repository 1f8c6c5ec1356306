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

# Half a card's width and height in units of its lean, how much its corners lack in them, and how
# many pixels it reaches from its middle. A pixel has as many of the units as the root of 17 says.
_HALF_ACROSS, _HALF_ALONG, _BLUNT = 72, 97, 5
_REACH = 30
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
    """A large card that leans by a pixel in four, to the left (-1) or to the right (1).

    Its middle is (0, 0). Whole numbers along and across the lean say what belongs to it, so every
    edge is a regular stair.
    """

    def __init__(self, lean):
        self._lean = lean
        self.canvas = Canvas(2 * _REACH + 1, 2 * _REACH + 1, "nothing")
        for y in range(-_REACH, _REACH + 1):
            for x in range(-_REACH, _REACH + 1):
                if self.holds(x, y):
                    self.canvas.put(x + _REACH, y + _REACH, "ink" if self._ends(x, y) else "white")

    def holds(self, x, y):
        across, along = abs(4 * x + self._lean * y), abs(4 * y - self._lean * x)
        corner = across > _HALF_ACROSS - _BLUNT and along > _HALF_ALONG - _BLUNT
        return across <= _HALF_ACROSS and along <= _HALF_ALONG and not corner

    def _ends(self, x, y):
        return not all(self.holds(x + dx, y + dy) for dx in (-1, 0, 1) for dy in (-1, 0, 1))

    def lay(self, upright, x, y):
        """Lays an upright drawing with its middle at a pixel, its rows moved on with the lean."""
        left, top = _REACH + x - upright.width // 2, _REACH + y - upright.height // 2
        for row in range(upright.height):
            moved = self._lean * ((upright.height // 2 - row) // 4)
            for column in range(upright.width):
                if upright.get(column, row) != "nothing":
                    self.canvas.put(left + column + moved, top + row, upright.get(column, row))

    def sign_corners(self, places, colour):
        """Sets signs, which lean of themselves, and the same upside down."""
        corner = Canvas(self.canvas.width, self.canvas.height, "nothing")
        for x, y, name in places:
            corner.text_grid(_REACH + x, _REACH + y, _SIGNS[name], {"#": colour})
        self.canvas.blit(corner, 0, 0, "nothing")
        self.canvas.blit(corner.rotated180(), 0, 0, "nothing")

    def draw(self, picture, x, y):
        picture.blit(self.canvas, x - _REACH, y - _REACH, "nothing")


def ace_of_spades():
    card = LeaningCard(1)
    card.canvas.text_grid(_REACH - 8, _REACH - 9, _SIGNS["spade"], {"#": "ink"})
    card.sign_corners(((-11, -22, "ace letter"), (-13, -13, "ace suit")), "ink")
    return card


def queen_of_hearts():
    """The game's own queen, as far to the right as the ace lets her be seen."""
    card, small = LeaningCard(-1), cards.new_card()
    courts.draw(small, "hearts", "queen")
    figure = Canvas(17, small.height - 4, "nothing")
    for y in range(figure.height):
        for x in range(figure.width):
            if small.get(x + 3, y + 2) != "white":
                figure.put(x, y, small.get(x + 3, y + 2))
    card.lay(figure, -2, 0)
    card.sign_corners(((-19, -16, "queen letter"), (-19, -7, "queen suit")), "card_red")
    return card


def chip_stack(picture, x, y, count, colours):
    shadow, felt = ellipse(x + 13, y + 7, 11, 4.5), ellipse(*_FELT)
    fill(picture, lambda px, py: shadow(px, py) and felt(px, py), "felt_1")
    chips.stack(picture, x, y, count, colours)


def title():
    picture = Canvas(WIDTH, HEIGHT)
    table(picture)
    fill(picture, ellipse(50, 82, 24, 6), "felt_1")
    queen, ace = queen_of_hearts(), ace_of_spades()
    fill(picture, lambda x, y: ellipse(*_FELT)(x, y) and (
        queen.holds(int(x) - 38, int(y) - 58) or ace.holds(int(x) - 62, int(y) - 59)), "felt_1")
    queen.draw(picture, 36, 54)
    ace.draw(picture, 59, 55)
    chip_stack(picture, 12, 88, 4, chips.RED)
    chip_stack(picture, 65, 88, 3, chips.BLUE)
    chip_stack(picture, 39, 94, 1, chips.BLACK)
    nameplate.draw(picture, 4, 2, "felt_0", "brass_3", "felt_7", ("felt_5", "felt_4", "felt_3"))
    return picture


def make_all(output_dir):
    title().save(output_dir / "140_title.png", 256)
