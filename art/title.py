"""The title picture: the name over a fan of three cards on a table. Hard pixels throughout."""

import math
from pathlib import Path

import chips
import courts
import nameplate
from card_base import new_card
from pixels import Canvas, read_grids

WIDTH, HEIGHT = 96, 116

# The table's middle and half axes, the height of its side, and the colours of its rail from the
# outside to the felt.
_TABLE = (48.5, 83, 47, 28)
_SIDE = 4
_RAIL = ("wood_2", "wood_4", "wood_4", "wood_4", "wood_3", "wood_0")

# A leaning card leans by a pixel in three. Half a card's width and height in thirds of a pixel (a
# leaning one comes out a twentieth smaller), and how much its corners lack in them; and a canvas
# that holds it however it leans.
_STEP = 3
_HALF_ACROSS, _HALF_ALONG, _BLUNT = 56, 74, 8
_REACH = 28

_SIGNS = read_grids(Path(__file__).resolve().parent / "sources" / "pictures" / "title.txt")


def ellipse(x, y, rx, ry):
    """The pixels whose middle lies within an ellipse."""
    return {(column, row) for column in range(WIDTH) for row in range(HEIGHT)
            if ((column + 0.5 - x) / rx) ** 2 + ((row + 0.5 - y) / ry) ** 2 < 1}


def within(shape):
    """A shape without its outline, which is a line of single pixels."""
    return {(x, y) for x, y in shape
            if {(x - 1, y), (x + 1, y), (x, y - 1), (x, y + 1)} <= shape}


def fill(picture, shape, colour, down=0):
    for x, y in shape:
        picture.put(x, y + down, colour)


def table(picture):
    """Draws the table, every ring of its rail parallel to the outermost; returns its felt."""
    shape = ellipse(*_TABLE)
    for down in range(_SIDE, 0, -1):
        fill(picture, shape, "wood_0" if down == _SIDE else "wood_1", down)
    for colour in _RAIL:
        fill(picture, shape, colour)
        shape = within(shape)
    for x, y in shape:
        picture.put(x, y, felt_colour(x + 0.5 - _TABLE[0], y + 3.5 - _TABLE[1]))
    return shape


def felt_colour(dx, dy):
    """A pool of light in the middle of the felt."""
    distance = math.hypot(dx / 40, dy / 22)
    return f"felt_{max(3, min(6, round(7.4 - 4 * distance)))}"


class Card:
    """A large card that leans to the left (-1), to the right (1) or not at all (0).

    Its middle is (0, 0). Whole numbers along and across the lean say what belongs to it, so every
    edge is a stair of equal steps. A figure on it keeps its rows and only moves with them; a sign
    stays upright.
    """

    def __init__(self, lean):
        self._lean = lean
        self._canvas = Canvas(2 * _REACH + 1, 2 * _REACH + 1, "nothing")
        reach = range(-_REACH, _REACH + 1)
        self._shape = {(x, y) for y in reach for x in reach if self._holds(x, y)}
        self._paper = within(self._shape)
        for x, y in self._shape:
            self._put(x, y, "white" if (x, y) in self._paper else "grey_60")

    def _holds(self, x, y):
        across = abs(_STEP * x + self._lean * y)
        along = abs(_STEP * y - self._lean * x)
        return (across <= _HALF_ACROSS and along <= _HALF_ALONG
                and across + along <= _HALF_ACROSS + _HALF_ALONG - _BLUNT)

    def _put(self, x, y, colour):
        self._canvas.put(x + _REACH, y + _REACH, colour)

    def _lay(self, drawing, left, top, lean):
        for row in range(drawing.height):
            moved = left - lean * (row // _STEP)
            for column in range(drawing.width):
                place, colour = (column + moved, top + row), drawing.get(column, row)
                if colour != "nothing" and place in self._paper:
                    self._put(*place, colour)

    def lay_figure(self, drawing, left, top):
        """Lays an upright drawing on the paper; (left, top) is where its first row begins."""
        self._lay(drawing, left, top, self._lean)

    def lay_sign(self, name, colour, left, top):
        self._lay(sign(name, colour), left, top, 0)

    def darken(self, shape, x, y):
        """Lets a shadow fall on the paper: a shape, as seen with the card's middle at (x, y)."""
        for column, row in self._paper:
            at = (column + _REACH, row + _REACH)
            if (column + x, row + y) in shape and self._canvas.get(*at) == "white":
                self._canvas.put(*at, "grey_d8")

    def turn(self):
        """Turns the card upside down, which keeps its lean."""
        self._canvas = self._canvas.rotated180()

    def shape(self, x, y):
        """Its pixels with its middle at (x, y)."""
        return {(x + column, y + row) for column, row in self._shape}

    def draw(self, picture, x, y):
        picture.blit(self._canvas, x - _REACH, y - _REACH, "nothing")


def sign(name, colour):
    grid = _SIGNS[name]
    drawing = Canvas(max(map(len, grid)), len(grid), "nothing")
    drawing.text_grid(0, 0, grid, {"#": colour})
    return drawing


def figure(suit, name, columns):
    """The first columns of a court as the game's own card shows it, without its paper."""
    card = new_card()
    courts.draw(card, suit, name)
    drawing = Canvas(columns, card.height - 2, "nothing")
    for y in range(drawing.height):
        for x in range(drawing.width):
            if card.get(x + 1, y + 1) != "white":
                drawing.put(x, y, card.get(x + 1, y + 1))
    return drawing


def queen_of_hearts():
    """Its right side and so its second corner lie under the ace."""
    card = Card(-1)
    card.lay_figure(figure("hearts", "queen", 20), -19, -16)
    card.lay_sign("Q", "card_red", -21, -16)
    card.lay_sign("heart", "card_red", -19, -7)
    return card


def king_of_spades():
    """Its left side lies under the ace, so its sign stands at the right, in the sword's place."""
    card = Card(1)
    card.lay_figure(figure("spades", "king", 19), -5, -19)
    card.lay_sign("K", "ink", 14, -14)
    card.lay_sign("spade", "ink", 12, -5)
    return card


def ace_of_spades():
    card = Card(0)
    for _ in range(2):
        card.lay_sign("A", "ink", -16, -21)
        card.lay_sign("spade", "ink", -16, -12)
        card.turn()
    card.lay_sign("large spade", "ink", -9, -10)
    return card


def chip_stack(picture, felt, x, y, count, colours):
    fill(picture, felt & ellipse(x + 13, y + 7, 11, 4.5), "felt_1")
    chips.stack(picture, x, y, count, colours)


def title():
    picture = Canvas(WIDTH, HEIGHT)
    felt = table(picture)
    ace = ace_of_spades()
    below = ((queen_of_hearts(), 26, 54), (king_of_spades(), 70, 54))
    hand = (*below, (ace, 48, 51))
    for card, x, y in hand:
        fill(picture, felt & card.shape(x, y + 3), "felt_1")
    for card, x, y in below:
        card.darken(ace.shape(46, 53) | ace.shape(50, 53), x, y)
    for card, x, y in hand:
        card.draw(picture, x, y)
    chip_stack(picture, felt, 13, 88, 4, chips.RED)
    chip_stack(picture, felt, 65, 88, 3, chips.BLUE)
    chip_stack(picture, felt, 39, 93, 2, chips.GOLD)
    nameplate.draw(picture, 4, 2, "felt_0", "brass_3", "felt_7", ("felt_5", "felt_4", "felt_3"))
    return picture


def make_all(output_dir):
    title().save(output_dir / "140_title.png", 256)
