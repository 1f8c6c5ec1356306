"""What can be pressed, with one light, one edge, one grey; and what is lit or marks a place."""

from pathlib import Path

from lettering import BOLD
from pixels import Canvas, read_grids

_SOURCES = Path(__file__).resolve().parent / "sources" / "pictures"
_SIGNS = read_grids(_SOURCES / "signs.txt")
_LAMP = read_grids(_SOURCES / "lamp.txt")["lamp"]


def raised(width, height):
    """A raised button with nothing on it, lit from the top left."""
    button = Canvas(width, height, "grey_40")
    button.rect(0, 0, width - 1, height - 1, "grey_80")
    button.rect(1, 1, width - 2, height - 2, "white")
    button.rect(2, 2, width - 2, height - 2, "button_face")
    return button


def sign(canvas, x, y, name, colour):
    canvas.text_grid(x, y, _SIGNS[name], {"#": colour})


def strategy_button():
    button = raised(24, 22)
    sign(button, 7, 4, "question", "sign_red")
    return button


def word_button(width, word):
    button = raised(width, 17)
    BOLD.write_centred(button, 0, width - 1, 5, word, "red_dark")
    return button


def bet_button(name, live):
    button = raised(16, 16)
    if live:
        sign(button, 4, 4, name, "black")
    else:
        sign(button, 5, 5, name, "white")
        sign(button, 4, 4, name, "grey_70")
    return button


def lamp(colour, name):
    """A round lamp, lit, set into the player box.

    The picture is copied as a block, so its corners have the colour that the box has at first. The
    sign tells right from wrong without the colour.
    """
    picture = Canvas(13, 13, "player_box")
    parts = (("#", "ring"), ("d", "shade"), ("c", "body"), ("l", "glow"), ("h", "gleam"))
    picture.text_grid(0, 0, _LAMP, {letter: f"lamp_{colour}_{part}" for letter, part in parts})
    sign(picture, 3, 3, name, "white")
    return picture


def active_mark():
    mark = Canvas(8, 4, "white")
    sign(mark, 0, 0, "triangle", "mark_red")
    return mark


def tool_bar():
    colours = {
        "K": "ink", "W": "white", "R": "card_red", "r": "red_dark", "G": "hit_green",
        "B": "blue",
    }
    bar = Canvas(80, 15, "nothing")
    pictures = read_grids(_SOURCES / "tool_bar.txt")
    for place, name in enumerate(("hit", "stand", "double", "split", "deal")):
        bar.text_grid(16 * place, 0, pictures[name], colours)
    return bar


def make_all(output_dir):
    tool_bar().save(output_dir / "128_toolbar.png", 16, transparent="nothing")
    strategy_button().save(output_dir / "133_strategy.png", 16)
    active_mark().save(output_dir / "134_active_mark.png", 16)
    word_button(73, "Insurance").save(output_dir / "139_insurance.png", 16)
    word_button(55, "Nope").save(output_dir / "143_no_insurance.png", 16)
    lamp("green", "check").save(output_dir / "141_lamp_green.png", 16)
    lamp("red", "cross").save(output_dir / "144_lamp_red.png", 16)
    for number, name, sign_name, live in (
        (136, "bet_up", "plus", True),
        (137, "bet_down", "minus", True),
        (138, "bet_down_off", "minus", False),
        (139, "bet_up_off", "plus", False),
    ):
        bet_button(sign_name, live).save(output_dir / f"icon_{number}_{name}.png", 16)
