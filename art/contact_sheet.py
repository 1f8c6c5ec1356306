"""All pictures on one sheet, on the green of the table, to be looked at as a whole."""

from PIL import Image

from palette import PALETTE

SCALE = 4
GAP = 3
CARDS_TO_A_ROW = 13
LAST_CARD_NUMBER = 65


def make(folder, path):
    """Puts the PNG pictures of a folder together into one: cards, then small to large."""
    files = sorted(folder.glob("*.png"))
    card_files = [file for file in files if _is_card(file)]
    cards = [_open(file) for file in card_files]
    others = [_open(file) for file in files if file not in card_files]
    others.sort(key=lambda picture: picture.height)

    width = CARDS_TO_A_ROW * (cards[0].width + GAP) + GAP
    places, bottom = _arrange(cards, GAP, width)
    more_places, bottom = _arrange(others, bottom, width)
    sheet = Image.new("RGB", (width, bottom), PALETTE["table_green"])
    for picture, place in zip(cards + others, places + more_places):
        sheet.paste(picture, place, picture)
    sheet = sheet.resize((sheet.width * SCALE, sheet.height * SCALE), Image.NEAREST)
    sheet.save(path, "PNG", optimize=False, compress_level=9)


def _is_card(file):
    number = file.name[:3]
    return number.isdigit() and int(number) <= LAST_CARD_NUMBER


def _open(file):
    with Image.open(file) as picture:
        return picture.convert("RGBA")


def _arrange(pictures, top, width):
    """Sets pictures in rows from `top` on; returns their places and where the next row begins."""
    places, x, y, row_height = [], GAP, top, 0
    for picture in pictures:
        if x + picture.width + GAP > width:
            x, y, row_height = GAP, y + row_height + GAP, 0
        places.append((x, y))
        x += picture.width + GAP
        row_height = max(row_height, picture.height)
    return places, y + row_height + GAP
