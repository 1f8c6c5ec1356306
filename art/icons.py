"""The application's icon: an ace of spades and a card's red back on felt."""

from pathlib import Path
from typing import Callable, NamedTuple

from PIL import Image

from lettering import BOLD, TINY
from pixels import Canvas, read_grids

_GRIDS = read_grids(Path(__file__).resolve().parent / "sources" / "pictures" / "icons.txt")


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


def _ace(tile, x, y, width, height, spade, index):
    card = Canvas(width, height, "nothing")
    _card(card, 0, 0, width, height, "white")
    if index:
        index(card)
        card.blit(card.rotated180(), 0, 0, transparent="white")
    card.text_grid((width - len(spade[0])) // 2, (height - len(spade)) // 2, spade, {"#": "ink"})
    _card(tile, x, y, width, height, "white")
    tile.blit(card, x, y, transparent="nothing")


def _letter(face):
    return lambda card: face.write(card, 2, 2, "A", "ink")


def _large_letter(card):
    card.text_grid(2, 2, _GRIDS["letter_9"], {"#": "ink"})


class Drawing(NamedTuple):
    """Where the two cards stand on a tile, and what is on the front one."""

    clipped: int
    back: tuple
    front: tuple
    width: int
    height: int
    spade: int
    index: Callable = None


DRAWN = {
    16: Drawing(1, (1, 1), (4, 2), 11, 13, 7),
    22: Drawing(2, (3, 2), (6, 4), 13, 16, 9),
    24: Drawing(2, (3, 2), (6, 4), 15, 18, 11),
    32: Drawing(3, (4, 3), (9, 5), 19, 24, 11, _letter(TINY)),
    48: Drawing(4, (7, 5), (14, 8), 27, 35, 17, _letter(BOLD)),
    64: Drawing(5, (9, 6), (19, 10), 35, 46, 23, _large_letter),
}


def _cards(tile, drawing, left=0, top=0):
    size = drawing.width, drawing.height
    _back(tile, left + drawing.back[0], top + drawing.back[1], *size)
    _ace(tile, left + drawing.front[0], top + drawing.front[1], *size,
         _GRIDS[f"spade_{drawing.spade}"], drawing.index)


def icon(size):
    """The icon in one of its drawn sizes."""
    tile = _felt(size, DRAWN[size].clipped)
    _cards(tile, DRAWN[size])
    return tile


def maskable():
    """The icon on felt that fills the square of 64 pixels, all of the cards within the circle of
    four fifths of it that remains under any mask."""
    tile = Canvas(64, 64, "felt_4")
    _cards(tile, DRAWN[48], 8, 8)
    return tile


def magnified(canvas, times):
    big = Canvas(canvas.width * times, canvas.height * times, "nothing")
    for y in range(canvas.height):
        for x in range(canvas.width):
            big.rect(x * times, y * times, (x + 1) * times, (y + 1) * times, canvas.get(x, y))
    return big


def _save(canvas, times, path):
    magnified(canvas, times).save(path, 16, transparent="nothing")


def _make_program_icon(pictures, path):
    """The icon inside a program for Windows, which asks for it in many sizes and in full colour."""
    images = [Image.open(picture).convert("RGBA") for picture in pictures]
    path.parent.mkdir(parents=True, exist_ok=True)
    images[-1].save(path, "ICO", append_images=images, sizes=[image.size for image in images])


def make_all(output_dir):
    """The program's own icon, in the sizes that its window takes."""
    for size, drawn, times in ((16, 16, 1), (32, 32, 1), (48, 48, 1), (128, 64, 2), (256, 64, 4)):
        _save(icon(drawn), times, output_dir / f"icon_128_{size}.png")


def make_editions(folder):
    """The icons that a desktop's menus show, and those of a page that a browser installs."""
    pictures = []
    for size in (16, 22, 24, 32, 48, 64, 128, 256):
        drawn = min(size, 64)
        pictures.append(folder / "desktop" / "icons" / f"feltside_{size}.png")
        _save(icon(drawn), size // drawn, pictures[-1])
    _make_program_icon(pictures, folder / "windows" / "feltside.ico")
    web = folder / "web" / "icons"
    _save(icon(64), 3, web / "feltside_192.png")
    _save(icon(64), 8, web / "feltside_512.png")
    _save(maskable(), 8, web / "feltside_maskable_512.png")
