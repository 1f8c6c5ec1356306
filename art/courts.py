"""The jacks, queens and kings: two-headed figures, cut by a line across the middle of the card."""

from pathlib import Path

from card_base import HEIGHT, WIDTH
from pixels import Canvas, read_grids

FIGURES = read_grids(Path(__file__).resolve().parent / "sources" / "cards" / "courts.txt")

# What the characters of the figures mean.
COLOURS = {
    "#": "ink", "K": "grey_40", "E": "grey_80", "e": "grey_c0", "w": "white",
    "s": "skin", "d": "skin_shade",
    "y": "gold_light", "g": "gold", "o": "gold_dark", "a": "orange",
    "t": "tan", "h": "brown", "H": "brown_dark",
    "r": "card_red", "R": "red_dark", "p": "red_light", "P": "purple",
    "v": "table_green", "V": "green_dark", "u": "green_light",
    "b": "blue", "n": "navy", "l": "blue_mid", "L": "blue_light",
}
# The first pixel of a figure on the card.
LEFT, TOP = 1, 1


def draw(card, suit, name):
    """Draws the figure into a blank card, the upper half and the same upside down."""
    upper = Canvas(WIDTH, HEIGHT)
    upper.text_grid(LEFT, TOP, FIGURES[f"{name} of {suit}"], COLOURS)
    lower = upper.rotated180()
    for y in range(1, HEIGHT - 1):
        for x in range(1, WIDTH - 1):
            # Below 0 above the line, above 0 below it; it falls by one pixel in five to the left.
            side = 5 * (y - HEIGHT // 2) + x - WIDTH // 2
            if abs(side) <= 2:
                card.put(x, y, "ink")
            else:
                card.put(x, y, (upper if side < 0 else lower).get(x, y))
