"""The card backs. Each is one function; BACKS lists them in the order of their numbers."""

from math import atan2, hypot, pi, sin
from pathlib import Path

from card_base import HEIGHT, WIDTH, new_card
from pixels import read_grids

GRIDS = read_grids(Path(__file__).resolve().parent / "sources" / "cards" / "backs.txt")

FIRST_NUMBER = 54
MIDDLE_X, MIDDLE_Y = WIDTH // 2, HEIGHT // 2
# Where the panel of a back begins, in pixels from the edge of the card: it leaves a white margin
# inside the outline.
PANEL = 3
# How far the points of a star reach from its middle, and the notches between them.
STAR, NOTCH = 10, 4.4


def make_all(folder):
    """Writes all backs."""
    for number, (name, make, max_colours) in enumerate(BACKS, FIRST_NUMBER):
        make().save(folder / f"{number:03}_back_{name}.png", max_colours)


def _panel(pattern, border):
    """A card with a panel whose colours `pattern` gives for the distances from the middle."""
    card = new_card()
    for y in range(PANEL + 1, HEIGHT - PANEL - 1):
        for x in range(PANEL + 1, WIDTH - PANEL - 1):
            card.put(x, y, pattern(x - MIDDLE_X, y - MIDDLE_Y))
    _frame(card, PANEL, border)
    return card


def _tiled(name, colours, border):
    """A card whose panel repeats a tile."""
    tile = GRIDS[name]
    height, width = len(tile), len(tile[0])
    return _panel(lambda dx, dy: colours[tile[dy % height][dx % width]], border)


def _frame(card, inset, name):
    """Draws a rectangle of single pixels, `inset` from the edge of the card."""
    right, bottom = WIDTH - 1 - inset, HEIGHT - 1 - inset
    card.line(inset, inset, right, inset, name)
    card.line(inset, bottom, right, bottom, name)
    card.line(inset, inset, inset, bottom, name)
    card.line(right, inset, right, bottom, name)


def _centred(card, y, name, colours):
    """Draws a figure in the middle of the card's width."""
    rows = GRIDS[name]
    card.text_grid((WIDTH - len(rows[0])) // 2, y, rows, colours)


def blue():
    return _tiled("blue tile", {" ": "blue", "l": "blue_mid", "o": "blue_light"}, "blue_dark")


def black():
    """Chevrons, dark on darker."""
    def chevrons(dx, dy):
        return ("grey_60", "grey_40", "black", "black")[(dy - abs((dx + 4) % 8 - 4)) % 4]

    return _panel(chevrons, "black")


def purple():
    colours = {" ": "purple", "o": "purple_light", "l": "purple_dark"}
    return _tiled("purple tile", colours, "purple_dark")


def dirty_yellow():
    """A honeycomb on which somebody has put down a cup."""
    card = _tiled("dirty yellow tile", {" ": "mustard_light", "h": "mustard"}, "mustard_dark")
    card.text_grid(8, 19, GRIDS["stain"], {"s": "brown", "t": "tan"})
    return card


def _pinstripes(strong, faint):
    """Stripes that keep clear of the frame on all sides."""
    stripes = (faint, "white", "white", strong, "white", "white")
    card = _panel(lambda dx, dy: stripes[dx % 6], strong)
    _frame(card, PANEL + 1, "white")
    return card


def red_pinstripes():
    return _pinstripes("card_red", "pink")


def blue_pinstripes():
    return _pinstripes("blue", "blue_pale")


def smiley():
    """A player with a good hand."""
    def dots(dx, dy):
        return "blue_light" if dx % 4 == 0 and dy % 4 == 0 else "blue_mid"

    card = _panel(dots, "blue_dark")
    _centred(card, 11, "smiley", {"#": "ink", "y": "gold_light", "g": "gold", "o": "orange",
                                  "p": "gold_pale", "w": "white", "r": "red"})
    return card


def skull():
    """Who always wins in the end: with hearts for eyes and a golden tooth."""
    card = _panel(lambda dx, dy: "black", "grey_80")
    colours = {"#": "black", "w": "white", "e": "grey_c0", "g": "gold",
               "y": "gold_light"}
    _centred(card, 5, "skull", colours)
    _centred(card, 25, "bones", colours)
    return card


def _star(card, outline, light, shade):
    """A star of five facetted points in the middle of the card."""
    def facet(dx, dy):
        """Which of the ten facets a point lies in; None outside the star."""
        turn = atan2(dx, -dy) * 5 / pi
        place = int(turn // 1)
        # From the tip of a point (0) to the notch beside it (1).
        part = turn - place if place % 2 == 0 else place + 1 - turn
        tip, notch = part * pi / 5, (1 - part) * pi / 5
        edge = STAR * NOTCH * sin(pi / 5) / (STAR * sin(tip) + NOTCH * sin(notch))
        return place if hypot(dx, dy) <= edge else None

    for dy in range(-STAR, STAR):
        for dx in range(-STAR, STAR + 1):
            place = facet(dx, dy)
            if place is None:
                continue
            beside = (facet(dx + x, dy + y) for x, y in ((-1, 0), (1, 0), (0, -1), (0, 1)))
            name = outline if None in beside else (shade if place % 2 == 0 else light)
            card.put(MIDDLE_X + dx, MIDDLE_Y + dy, name)


def blue_star():
    card = _panel(lambda dx, dy: "blue_pale", "blue")
    _star(card, "navy", "blue_mid", "blue")
    for x in (5, 17):
        for y in (5, 29):
            card.text_grid(x, y, GRIDS["small star"], {"#": "blue"})
    return card


def purple_star():
    def rays(dx, dy):
        return "purple_pale" if (atan2(dx, dy) * 8 / pi + 0.5) % 2 < 1 else "white"

    card = _panel(rays, "purple")
    _star(card, "purple_dark", "purple_light", "purple")
    return card


def _brushed_plate():
    """A steel plate with a sheen across it and bevelled edges."""
    card = new_card("steel_light")
    for y in range(1, HEIGHT - 1):
        for x in range(1, WIDTH - 1):
            sheen = (x + y) % 30
            if sheen < 3 or 6 <= sheen < 8:
                card.put(x, y, "steel_pale")
            elif y % 3 == 0 and sheen > 3:
                card.put(x, y, "steel_pale" if sheen < 8 else "steel_mid")
    for inset, light, dark in ((1, "white", "steel_dark"), (2, "steel_pale", "steel")):
        _frame(card, inset, dark)
        card.line(inset, inset, WIDTH - 1 - inset, inset, light)
        card.line(inset, inset, inset, HEIGHT - 1 - inset, light)
    return card


def metal_rivet():
    """A riveted plate; where one rivet has gone, a sticking plaster will have to do."""
    card = _brushed_plate()
    colours = {"l": "white", "m": "steel_pale", "d": "steel_light", "s": "steel",
               "S": "steel_dark"}
    for y in (4, 18, 32):
        for x in (4, 12, 20):
            card.text_grid(x, y, GRIDS["rivet"], colours)
    _centred(card, 18, "plaster", {"a": "skin", "b": "pink", "d": "skin_shade"})
    return card


def wild():
    """A tiger between leaves."""
    card = _tiled("leaves tile", {" ": "green_dark", "g": "table_green", "l": "green"},
                  "brown_dark")
    face = [left + left[-2::-1] for left in GRIDS["tiger"]]
    card.text_grid(3, 8, face, {"#": "ink", "O": "orange", "w": "white", "p": "red_light",
                                "y": "gold_light", "k": "black", "r": "card_red"})
    return card


# File name, program, most colours.
BACKS = (
    ("blue", blue, 16),
    ("black", black, 16),
    ("purple", purple, 16),
    ("smiley", smiley, 256),
    ("dirty_yellow", dirty_yellow, 16),
    ("red_pinstripes", red_pinstripes, 16),
    ("blue_pinstripes", blue_pinstripes, 16),
    ("skull", skull, 16),
    ("blue_star", blue_star, 16),
    ("purple_star", purple_star, 16),
    ("metal_rivet", metal_rivet, 256),
    ("wild", wild, 16),
)
