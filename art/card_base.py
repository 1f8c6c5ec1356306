"""What every card has, face or back: its size, its outline, its clipped corners."""

from pixels import Canvas

WIDTH, HEIGHT = 29, 41

# A middle grey, so that the black suits stand clear of it.
OUTLINE = "grey_60"
# The table is any colour and cards are copied as plain blocks, so a corner cannot show it. This
# tone is read as a softened corner on white, on the green cloth and on blue alike; the lighter one
# inside the outline's bend rounds it off.
CORNER = "grey_80"
INNER_CORNER = "grey_c0"


def new_card(fill="white"):
    """A card with its outline, filled with one colour."""
    card = Canvas(WIDTH, HEIGHT, OUTLINE)
    card.rect(1, 1, WIDTH - 1, HEIGHT - 1, fill)
    for inset, tone in ((0, CORNER), (1, INNER_CORNER)):
        for x in (inset, WIDTH - 1 - inset):
            for y in (inset, HEIGHT - 1 - inset):
                card.put(x, y, tone)
    return card
