"""The game's name in its own lettering."""

from pathlib import Path

from lettering import LOGO
from pixels import read_grids

_PIP = read_grids(Path(__file__).resolve().parent / "sources" / "pictures" / "signs.txt")["pip"]
_AROUND = [(dx, dy) for dx in (-1, 0, 1) for dy in (-1, 0, 1)]

WIDTH = LOGO.width("Feltside")
# Rows from the top of the F that catch less and less light, with the last of their fills.
_SHADES = (9, 14)


def draw(picture, left, top, outline, shadow, lit, fills):
    """Draws the name; `left` and `top` are those of the F without its outline.

    `lit` colours the edges towards the light, `fills` the body from top to bottom. The dot of the
    i is a red heart.
    """
    letters = {(left + x, top + y) for x, y in LOGO.pixels("Feltside")}
    edge = sorted({(x + dx, y + dy) for x, y in letters for dx, dy in _AROUND})
    for x, y in edge:
        picture.put(x + 1, y + 1, shadow)
    for x, y in edge:
        picture.put(x, y, outline)
    for x, y in sorted(letters):
        at_edge = (x, y - 1) not in letters or (x - 1, y) not in letters
        fill = fills[sum(y - top >= row for row in _SHADES)]
        picture.put(x, y, lit if at_edge else fill)
    picture.text_grid(left + LOGO.width("Felts") + 2, top - 1, _PIP,
                      {"#": "red_dark", "o": "red", "+": "red_light"})
