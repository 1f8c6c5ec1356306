"""The application's icon: an ace of spades and a card's red back on felt."""

from pathlib import Path

from lettering import BOLD, TINY
from pixels import Canvas, read_grids

_SPADES = read_grids(Path(__file__).resolve().parent / "sources" / "pictures" / "icons.txt")


def _felt(size, corner):
    """A tile of felt with clipped corners and a rim that is lit from the top left."""
    tile = Canvas(size, size, "nothing")
    for y in range(size):
        for x in range(size):
            edge_x, edge_y = min(x, size - 1 - x), min(y, size - 1 - y)
            if edge_x + edge_y < corner:
                continue
            rim = min(edge_x, edge_y) == 0 or edge_x + edge_y == corner
            tile.put(x, y, ("felt_6" if x + y < size - 1 else "felt_1") if rim else "felt_4")
    return tile


def _card(tile, x, y, width, height, face):
    """A card with clipped corners, outlined in ink, its right and lower edge in shadow."""
    tile.rect(x + 2, y + height, x + width, y + height + 1, "felt_2")
    tile.rect(x + width, y + 2, x + width + 1, y + height, "felt_2")
    tile.rect(x + 1, y, x + width - 1, y + height, "ink")
    tile.rect(x, y + 1, x + width, y + height - 1, "ink")
    tile.rect(x + 1, y + 1, x + width - 1, y + height - 1, face)


def _back(tile, x, y, width, height):
    _card(tile, x, y, width, height, "white")
    for row in range(y + 2, y + height - 2):
        for column in range(x + 2, x + width - 2):
            tile.put(column, row, "red" if (column + row) % 4 == 0 else "card_red")


def _ace(tile, x, y, width, height, spade, index_face):
    card = Canvas(width, height, "nothing")
    _card(card, 0, 0, width, height, "white")
    if index_face:
        index_face.write(card, 2, 2, "A", "ink")
        card.blit(card.rotated180(), 0, 0, transparent="white")
    card.text_grid((width - len(spade[0])) // 2, (height - len(spade)) // 2, spade, {"#": "ink"})
    _card(tile, x, y, width, height, "white")
    tile.blit(card, x, y, transparent="nothing")


def icon(size):
    """The icon in one of its drawn sizes."""
    corner, back, front, width, height, spade, index_face = {
        16: (1, (1, 1), (4, 2), 11, 13, 7, None),
        32: (3, (4, 3), (9, 5), 19, 24, 11, TINY),
        48: (4, (7, 5), (14, 8), 27, 35, 17, BOLD),
    }[size]
    tile = _felt(size, corner)
    _back(tile, *back, width, height)
    _ace(tile, *front, width, height, _SPADES[f"spade_{spade}"], index_face)
    return tile


def magnified(canvas, times):
    big = Canvas(canvas.width * times, canvas.height * times, "nothing")
    for y in range(canvas.height):
        for x in range(canvas.width):
            big.rect(x * times, y * times, (x + 1) * times, (y + 1) * times, canvas.get(x, y))
    return big


def make_all(output_dir):
    for size, drawn, times in ((16, 16, 1), (32, 32, 1), (48, 48, 1), (128, 32, 4), (256, 32, 8)):
        magnified(icon(drawn), times).save(
            output_dir / f"icon_128_{size}.png", 16, transparent="nothing")
