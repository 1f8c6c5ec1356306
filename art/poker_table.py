"""The video-poker machine: pay table, card bay, button and two panels.

The game writes its texts opaque on cells of a fixed colour, so the button's face and the panels
are flat in just that colour wherever a text can reach.
"""

import chips
import nameplate
import shapes
from buttons import sign
from lettering import BOLD, PLAIN, TINY
from pixels import Canvas

WIDTH, HEIGHT = 240, 270
# The last two rows lie below the table's edge.
SEEN_HEIGHT = 268

# Where the game puts things: left, top, right, bottom.
BUTTON = (70, 180, 155, 215)
# All panels have the same edges: as far out as the longest result needs, which ends eight columns
# before the right edge of the picture. LEFT and RIGHT are those of what is inside their frames.
LEFT, RIGHT = 4, WIDTH - 4
WALLET = (LEFT, 230, 114, 254)
RESULT = (WIDTH - 114, 230, RIGHT, 254)
CARDS = [(x, 114, x + 29, 155) for x in (40, 73, 106, 139, 172)]

PAYS = (
    ("Royal Flush", "250"), ("Straight Flush", "50"), ("Four of a Kind", "20"),
    ("Full House", "7"), ("Flush", "5"), ("Straight", "4"), ("Three of a Kind", "3"),
    ("Two Pair", "2"),
)


def night(step):
    return f"night_{step}"


def bevel(picture, box, light, dark):
    """A frame one pixel wide on the inside edge of a box."""
    left, top, right, bottom = box
    picture.rect(left, top, right, top + 1, light)
    picture.rect(left, top, left + 1, bottom, light)
    picture.rect(left, bottom - 1, right, bottom, dark)
    picture.rect(right - 1, top, right, bottom, dark)


def grown(box, by):
    left, top, right, bottom = box
    return left - by, top - by, right + by, bottom + by


def sunk_panel(picture, box, face):
    """A flat panel let into the cabinet, its frame one pixel wide around the box."""
    bevel(picture, grown(box, 1), night(0), night(12))
    picture.rect(*box, face)


def shaded(picture, box, top_step, bottom_step):
    """A box that fades from one step of the night to another, the steps mixed by a chequer."""
    left, top, right, bottom = box
    for y in range(top, bottom):
        exact = top_step + (bottom_step - top_step) * (y - top) / (bottom - top - 1)
        for x in range(left, right):
            threshold = _MIX[y % 4][x % 4] / 16
            picture.put(x, y, night(int(exact + threshold)))


# How the steps of a fade are mixed: a 4 x 4 pattern of thresholds without visible rows.
_MIX = ((0, 8, 2, 10), (12, 4, 14, 6), (3, 11, 1, 9), (15, 7, 13, 5))


def cabinet(picture):
    """The body, lighter at the top, the desk for the button and the panels, a rim around all."""
    shaded(picture, (0, 0, WIDTH, HEIGHT), 8, 4)
    shaded(picture, (1, 167, WIDTH - 1, SEEN_HEIGHT - 1), 9, 6)
    picture.rect(1, 165, WIDTH - 1, 166, night(2))
    picture.rect(1, 166, WIDTH - 1, 167, night(14))
    bevel(picture, (0, 0, WIDTH, SEEN_HEIGHT), night(14), night(14))


def soft_suit(picture, shape, x, y, half_height, ramp):
    """A suit with soft edges; the ramp goes from the ground to the suit's own colour."""
    reach = half_height + 1
    for py in range(int(y - reach), int(y + reach) + 1):
        for px in range(int(x - reach), int(x + reach) + 1):
            covered = shapes.coverage(shapes.placed(shape, x, y, half_height), px, py)
            step = round(covered * (len(ramp) - 1))
            if step:
                picture.put(px, py, ramp[step])


def bulb(picture, x, y, lit):
    """A bulb of 3 x 3 pixels in the rim of the marquee."""
    body, glint = ("gold", "gold_pale") if lit else ("brass_1", "brass_3")
    picture.rect(x + 1, y, x + 2, y + 3, body)
    picture.rect(x, y + 1, x + 3, y + 2, body)
    picture.put(x + 1, y + 1, glint)


def marquee(picture):
    box = (LEFT, 6, RIGHT, 37)
    sunk_panel(picture, box, night(2))
    left, top, right, bottom = box
    for row, y in enumerate((top + 1, bottom - 4)):
        for place in range(28):
            bulb(picture, left + 6 + 8 * place, y, (place + row) % 2 == 0)
    BOLD.write_centred(picture, left, 72, 18, "VIDEO", "blue_light")
    BOLD.write_centred(picture, 168, right, 18, "POKER", "blue_light")
    nameplate.draw(picture, (WIDTH - nameplate.WIDTH) // 2, 12, night(0), "brass_1", "gold_pale",
                   ("gold_light", "gold", "brass_3"))


def pay_table(picture):
    box = (LEFT, 42, RIGHT, 105)
    sunk_panel(picture, box, night(3))
    left, top, right, _ = box
    middle, pitch = (left + right) // 2, 16
    half = middle - left
    for place, (name, pays) in enumerate(PAYS):
        column, row = divmod(place, 4)
        x, y = (middle if column else left), top + pitch * row
        if row % 2:
            picture.rect(x, y - 1, x + half, y + pitch - 1, night(2))
        best = place == 0
        PLAIN.write(picture, x + 8, y + 4, name, "gold_light" if best else night(19))
        BOLD.write_right(picture, x + half - 8, y + 4, pays, "gold_light")
    picture.rect(middle - 1, top, middle, top + 63, night(0))
    picture.rect(middle, top, middle + 1, top + 63, night(7))


def card_bay(picture):
    sunk_panel(picture, (34, 110, 207, 159), night(2))
    picture.rect(34, 110, 207, 112, night(1))
    for card in CARDS:
        bevel(picture, grown(card, 1), night(0), night(6))
        picture.rect(*card, night(3))
        x, y = (card[0] + card[2]) / 2, (card[1] + card[3]) / 2
        soft_suit(picture, shapes.spade, x, y, 11, [night(step) for step in range(3, 7)])
    inlay = [night(step) for step in (7, 9, 11, 13)]
    for shape, x, y in ((shapes.spade, 18.5, 124.5), (shapes.heart, 18.5, 147.5),
                        (shapes.club, 221.5, 124.5), (shapes.diamond, 221.5, 147.5)):
        soft_suit(picture, shape, x + 1, y + 1, 8, [night(step) for step in (7, 5, 4, 3)])
        soft_suit(picture, shape, x, y, 8, inlay)


def button(picture):
    bevel(picture, grown(BUTTON, 2), night(2), night(12))
    bevel(picture, grown(BUTTON, 1), night(0), night(0))
    picture.rect(*BUTTON, "cell_violet")
    bevel(picture, BUTTON, "violet_pale", "violet_dark")
    bevel(picture, grown(BUTTON, -1), "violet_light", "violet_dark")
    # The word's ink goes from 104 to 130: what stands before it and after it leaves as much room
    # beside the word, and the same at both ends of the button.
    _small_card(picture, 82, 190, "card_red", "pink")
    _small_card(picture, 87, 193, "white", "white")
    sign(picture, 90, 198, "heart", "card_red")
    sign(picture, 138, 195, "arrow", "violet_pale")


def _small_card(picture, x, y, face, edge):
    """A card of 10 x 14 pixels beside the button's word."""
    picture.rect(x + 1, y, x + 9, y + 14, "violet_dark")
    picture.rect(x, y + 1, x + 10, y + 13, "violet_dark")
    picture.rect(x + 1, y + 1, x + 9, y + 13, edge)
    picture.rect(x + 2, y + 2, x + 8, y + 12, face)


def displays(picture):
    sunk_panel(picture, WALLET, "cell_blue")
    sunk_panel(picture, RESULT, "cell_slate")


def desk(picture):
    """What stands about the button: the player's chips, and the slot for the dollar."""
    for x, y in ((12, 198), (36, 202)):
        picture.rect(x + 4, y + 9, x + chips.WIDTH + 3, y + 12, night(5))
        picture.rect(x + 9, y + 7, x + chips.WIDTH + 5, y + 11, night(5))
    chips.stack(picture, 12, 198, 5, chips.BLUE)
    chips.stack(picture, 36, 202, 3, chips.GOLD)
    plate = (174, 180, RIGHT - 1, 215)
    bevel(picture, grown(plate, 2), night(13), night(2))
    bevel(picture, grown(plate, 1), night(11), night(3))
    shaded(picture, plate, 9, 6)
    bevel(picture, (183, 186, 191, 209), night(1), night(12))
    picture.rect(184, 187, 190, 208, night(4))
    picture.rect(186, 189, 188, 206, night(0))
    BOLD.write_centred(picture, 195, 231, 188, "$1", "gold_light")
    TINY.write_centred(picture, 195, 231, 200, "A DEAL", night(18))


def labels(picture):
    for (left, top, _, _), label in ((WALLET, "WALLET"), (RESULT, "RESULT")):
        TINY.write(picture, left, top - 9, label, night(18))


def poker_table():
    picture = Canvas(WIDTH, HEIGHT, night(2))
    cabinet(picture)
    marquee(picture)
    pay_table(picture)
    card_bay(picture)
    desk(picture)
    button(picture)
    displays(picture)
    labels(picture)
    return picture


def make_all(output_dir):
    poker_table().save(output_dir / "142_poker_table.png", 256)
