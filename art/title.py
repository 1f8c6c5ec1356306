"""The title picture: the name over a table that has a seat free."""

import math

import cards
import chips
import nameplate
import shapes
from lettering import stroked
from pixels import Canvas
from scene import Scene

WIDTH, HEIGHT = 96, 116

# The felt's middle and half axes, and how much wider the rail around it is.
_FELT = (48, 83.5, 40, 21)
_RAIL = 6
_RAIL_DEPTH = 4

_CARD_WIDTH, _CARD_HEIGHT = 34, 48
# The point about which the cards are fanned, and how far below their lower edge it lies.
_PIVOT = (46, 104)
_REACH = 25
_QUEEN = cards.make_face("hearts", "queen", "Q")


def ellipse(x, y, rx, ry):
    return lambda px, py: ((px - x) / rx) ** 2 + ((py - y) / ry) ** 2 < 1


def table(scene):
    x, y, rx, ry = _FELT
    outer = ellipse(x, y, rx + _RAIL, ry + _RAIL)
    for drop in range(_RAIL_DEPTH, 0, -1):
        scene.lay(ellipse(x, y + drop, rx + _RAIL, ry + _RAIL), "wood_0" if drop > 1 else "wood_1")
    scene.lay(outer, "wood_3")
    scene.lay(lambda px, py: outer(px, py) and not ellipse(x, y, rx + 4, ry + 4)(px, py),
              lambda px, py: "wood_4" if py > y else "wood_2")
    scene.lay(lambda px, py: ellipse(x, y, rx + 4, ry + 4)(px, py)
              and not ellipse(x, y, rx + 3, ry + 3)(px, py), "wood_5")
    scene.lay(ellipse(x, y, rx + 1, ry + 1), "wood_0")
    scene.lay(ellipse(x, y, rx, ry), lambda px, py: felt_colour(px - x, py - y + 3))
    scene.lay(lambda px, py: ellipse(x, y, rx - 6, ry - 4.8)(px, py)
              and not ellipse(x, y, rx - 7, ry - 6)(px, py), "felt_6")


def felt_colour(dx, dy):
    """A pool of light in the middle of the felt."""
    distance = math.hypot(dx / 40, dy / 22)
    return f"felt_{max(3, min(6, round(7.4 - 4 * distance)))}"


def card(scene, turn, face):
    """A card turned about the hand, `face` giving the colour at a point of it."""
    cosine, sine = math.cos(math.radians(turn)), math.sin(math.radians(turn))

    def local(px, py):
        dx, dy = px - _PIVOT[0], py - _PIVOT[1]
        return (cosine * dx + sine * dy + _CARD_WIDTH / 2,
                -sine * dx + cosine * dy + _CARD_HEIGHT + _REACH)

    def inside(margin):
        def test(px, py):
            u, v = local(px, py)
            du = max(margin + 2.5 - u, u - (_CARD_WIDTH - margin - 2.5), 0)
            dv = max(margin + 2.5 - v, v - (_CARD_HEIGHT - margin - 2.5), 0)
            return math.hypot(du, dv) < 2.5
        return test

    scene.lay(inside(0), "ink")
    scene.lay(inside(1.2), lambda px, py: face(*local(px, py)))


def ace_of_spades(u, v):
    middle = shapes.placed(shapes.spade, _CARD_WIDTH / 2, _CARD_HEIGHT / 2 - 0.5, 10.5)
    if middle(u, v) or index(u, v, "A", shapes.spade):
        return "ink"
    return "white"


def queen_of_hearts(u, v):
    """The game's own queen, a little larger; her corners are drawn anew to read when turned."""
    if u < 9 or u > _CARD_WIDTH - 9:
        return "card_red" if index(u, v, "Q", shapes.heart) else "white"
    column, row = int(u * _QUEEN.width / _CARD_WIDTH), int(v * _QUEEN.height / _CARD_HEIGHT)
    return _QUEEN.get(column, row)


def index(u, v, letter, suit):
    """The rank and the suit in two opposite corners."""
    if v > _CARD_HEIGHT / 2:
        u, v = _CARD_WIDTH - u, _CARD_HEIGHT - v
    if shapes.placed(suit, 5.4, 15.5, 3.5)(u, v):
        return True
    return v < 12 and stroked(letter, 0.68)((u - 3) / 1.1, (v - 3.6) / 1.1)


def chip_stack(picture, x, y, count, colours):
    shadow, felt = ellipse(x + 13, y + 7, 11, 4.5), ellipse(*_FELT)
    for py in range(y, y + 14):
        for px in range(x, x + 26):
            if shadow(px + 0.5, py + 0.5) and felt(px + 0.5, py + 0.5):
                picture.put(px, py, "felt_1")
    chips.stack(picture, x, y, count, colours)


def title():
    picture = Canvas(WIDTH, HEIGHT)
    scene = Scene(picture)
    table(scene)
    scene.lay(ellipse(50, 82, 22, 6), "felt_1")
    card(scene, -14, queen_of_hearts)
    card(scene, 12, ace_of_spades)
    chip_stack(picture, 12, 88, 4, chips.RED)
    chip_stack(picture, 65, 88, 3, chips.BLUE)
    chip_stack(picture, 39, 94, 1, chips.BLACK)
    nameplate.draw(picture, 4, 2, "felt_0", "brass_3", "felt_7", ("felt_5", "felt_4", "felt_3"))
    return picture


def make_all(output_dir):
    title().save(output_dir / "140_title.png", 256)
