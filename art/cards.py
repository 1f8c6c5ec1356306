"""The 52 card faces."""

from pathlib import Path

import courts
from card_base import HEIGHT, WIDTH, new_card
from pixels import Canvas, read_grids

SOURCES = Path(__file__).resolve().parent / "sources" / "cards"
GLYPHS = read_grids(SOURCES / "ranks.txt")
PIPS = read_grids(SOURCES / "pips.txt")

# In the order of the card numbers: thirteen cards to a suit, ace to king.
SUITS = ("clubs", "diamonds", "hearts", "spades")
RANKS = (("ace", "A"), ("two", "2"), ("three", "3"), ("four", "4"), ("five", "5"), ("six", "6"),
         ("seven", "7"), ("eight", "8"), ("nine", "9"), ("ten", "10"), ("jack", "J"),
         ("queen", "Q"), ("king", "K"))

BLACK_SUIT = {"#": "black"}
RED_SUIT = {"#": "card_red"}
SUIT_COLOURS = {"clubs": BLACK_SUIT, "diamonds": RED_SUIT, "hearts": RED_SUIT,
                "spades": BLACK_SUIT}

# Where the corner index stands: centred on a column, as a fan shows just columns 0 to 8 of a card.
INDEX_MIDDLE, GLYPH_Y, INDEX_PIP_Y = 4, 2, 10

# Top left corners of the pips. The first places are set again upside down in the lower half, the
# second ones are not. Side by side or one below the other, they stand evenly spaced.
LEFT, MIDDLE, RIGHT = 9, 12, 15


def _pairs(*rows):
    return tuple((x, y) for y in rows for x in (LEFT, RIGHT))


PIP_PLACES = {
    "2": (((10, 4),), ()),
    "3": (((10, 4),), ((10, 16),)),
    "4": (_pairs(4), ()),
    "5": (_pairs(4), ((MIDDLE, 17),)),
    "6": (_pairs(4), _pairs(17)),
    "7": (_pairs(3), _pairs(17) + ((MIDDLE, 10),)),
    "8": (_pairs(3) + ((MIDDLE, 10),), _pairs(17)),
    "9": (_pairs(2, 10), ((MIDDLE, 17),)),
    "10": (_pairs(2, 13) + ((MIDDLE, 8),), ()),
    # Five rows of two: between four rows the leaves of a single club would have no air about them.
    "10 of clubs": (_pairs(2, 10), _pairs(17)),
}
PIP_SIZES = {"2": "big", "3": "big", "4": "medium", "5": "medium", "6": "medium"}


def make_all(folder):
    """Writes all faces, numbered from 1."""
    faces = [(suit, name, letter) for suit in SUITS for name, letter in RANKS]
    for number, (suit, name, letter) in enumerate(faces, 1):
        path = folder / f"{number:03}_{name}_of_{suit}.png"
        make_face(suit, name, letter).save(path, max_colours=16)


def make_face(suit, name, letter):
    """One face: `name` and `letter` are a pair of RANKS."""
    card = new_card()
    if letter in ("J", "Q", "K"):
        courts.draw(card, suit, name)
    elif letter == "A":
        _draw_ace(card, suit)
    else:
        _draw_pips(card, suit, letter)
    index = _make_index(suit, letter)
    card.blit(index, 0, 0, transparent="white")
    card.blit(index.rotated180(), 0, 0, transparent="white")
    return card


def _make_index(suit, letter):
    index = Canvas(WIDTH, HEIGHT)
    for y, sign in ((GLYPH_Y, GLYPHS[letter]), (INDEX_PIP_Y, PIPS[f"{suit} index"])):
        x = INDEX_MIDDLE - (len(sign[0]) - 1) // 2
        index.text_grid(x, y, sign, SUIT_COLOURS[suit])
    return index


def _draw_ace(card, suit):
    pip = PIPS[f"{suit} large"]
    card.text_grid((WIDTH - len(pip[0])) // 2, (HEIGHT - len(pip)) // 2, pip, SUIT_COLOURS[suit])


def _draw_pips(card, suit, letter):
    colours = SUIT_COLOURS[suit]
    size = PIP_SIZES.get(letter, "small")
    pip = PIPS[f"{suit} {size}"]
    turned = [row[::-1] for row in reversed(pip)]
    # The black suits may have a row more, for the stem; the bodies stand at one height.
    drop = len(PIPS[f"spades {size}"]) - len(pip)
    mirrored, single = PIP_PLACES.get(f"{letter} of {suit}", PIP_PLACES[letter])
    for x, y in mirrored + single:
        card.text_grid(x, y + drop, pip, colours)
    for x, y in mirrored:
        card.text_grid(WIDTH - x - len(pip[0]), HEIGHT - y - drop - len(pip), turned, colours)
