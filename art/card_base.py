"""What every card has, face or back: its size, its outline, its clipped corners."""

from pixels import Canvas

WIDTH, HEIGHT = 29, 41

OUTLINE = "ink"
# The table is any colour and cards are copied as plain blocks, so a corner cannot show it. This
# middle tone is read as a softened corner on white, on the green cloth and on blue alike.
CORNER = "grey_80"


def new_card(fill="white"):
    """A card with its outline, filled with one colour."""
    card = Canvas(WIDTH, HEIGHT, OUTLINE)
    card.rect(1, 1, WIDTH - 1, HEIGHT - 1, fill)
    for x in (0, WIDTH - 1):
        for y in (0, HEIGHT - 1):
            card.put(x, y, CORNER)
    return card
