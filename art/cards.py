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

BLACK_SUIT = {"#": "black", "+": "grey_a0"}
RED_SUIT = {"#": "card_red", "+": "red_light"}
SUIT_COLOURS = {"clubs": BLACK_SUIT, "diamonds": RED_SUIT, "hearts": RED_SUIT,
                "spades": BLACK_SUIT}

# Where the corner index stands: it must end left of column 9, which is all that a fan shows.
GLYPH_X, GLYPH_Y = 2, 2
INDEX_PIP_X, INDEX_PIP_Y = 1, 10

# Top left corners of the pips. The first places are set again upside down in the lower half, the
# second ones are not.
LEFT, MIDDLE, RIGHT = 9, 12, 15
_PAIR = ((LEFT, 3), (RIGHT, 3))
_MIDDLE_PAIR = ((LEFT, 17), (RIGHT, 17))
_TWO_PAIRS = _PAIR + ((LEFT, 13), (RIGHT, 13))
PIP_PLACES = {
    "2": (((11, 4),), ()),
    "3": (((11, 4),), ((11, 17),)),
    "4": (_PAIR, ()),
    "5": (_PAIR, ((MIDDLE, 17),)),
    "6": (_PAIR, _MIDDLE_PAIR),
    "7": (_PAIR, _MIDDLE_PAIR + ((MIDDLE, 10),)),
    "8": (_PAIR + ((MIDDLE, 10),), _MIDDLE_PAIR),
    "9": (_TWO_PAIRS, ((MIDDLE, 18),)),
    "10": (_TWO_PAIRS + ((MIDDLE, 8),), ()),
}
PIP_SIZES = {"2": "index", "3": "index", "9": "tiny", "10": "tiny"}


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
    colours = SUIT_COLOURS[suit]
    index.text_grid(GLYPH_X, GLYPH_Y, GLYPHS[letter], colours)
    index.text_grid(INDEX_PIP_X, INDEX_PIP_Y, PIPS[f"{suit} index"], colours)
    return index


def _draw_ace(card, suit):
    pip = PIPS[f"{suit} large"]
    card.text_grid((WIDTH - len(pip[0])) // 2, (HEIGHT - len(pip)) // 2, pip, SUIT_COLOURS[suit])


def _draw_pips(card, suit, letter):
    colours = SUIT_COLOURS[suit]
    pip = PIPS[f"{suit} {PIP_SIZES.get(letter, 'small')}"]
    turned = [row[::-1] for row in reversed(pip)]
    mirrored, single = PIP_PLACES[letter]
    for x, y in mirrored + single:
        card.text_grid(x, y, pip, colours)
    for x, y in mirrored:
        card.text_grid(WIDTH - x - len(pip[0]), HEIGHT - y - len(pip), turned, colours)
