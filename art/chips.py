"""Stacks of chips, seen from a seat."""

from pathlib import Path

from pixels import read_grids

_TOP = read_grids(Path(__file__).resolve().parent / "sources" / "pictures" / "chip.txt")["top"]
WIDTH = 19
_EDGE = 3
# The columns of the white marks on a chip's edge; each chip of a stack is turned a little.
_MARKS = ({1, 2, 8, 9, 10, 16, 17}, {4, 5, 13, 14})
# From here on the edge turns away from the light.
_SHADED = 12

# Top, sunk middle, edge in the light, edge in the shade.
RED = ("red", "card_red", "card_red", "red_dark")
BLUE = ("blue_mid", "blue", "blue", "blue_dark")
GOLD = ("gold_light", "gold", "gold", "gold_dark")


def stack(picture, x, y, count, colours):
    """Draws a stack; (x, y) is the top left of the lowest chip's top face."""
    for level in range(count):
        _chip(picture, x, y - _EDGE * level, colours, _MARKS[level % 2])


def _chip(picture, x, y, colours, marks):
    top, middle, lit, shaded = colours
    for column in range(WIDTH):
        low = y + max(row for row, line in enumerate(_TOP) if line[column] != " ")
        edge = lit if column < _SHADED else shaded
        if column in marks:
            edge = "white" if column < _SHADED else "grey_d8"
        picture.rect(x + column, low, x + column + 1, low + _EDGE, edge)
        picture.put(x + column, low + _EDGE, "grey_60" if column in marks else "black")
    picture.text_grid(x, y, _TOP, {"C": top, "L": middle, "W": "white"})
