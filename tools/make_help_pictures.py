#!/usr/bin/python3
"""Makes every picture of the help pages again, from the game as it is built.

    tools/make_help_pictures.py [STYLUS]

plays the scenes below with the stylus program (default: build/play/feltside-stylus), each from a
fresh start with settings of its own, and writes them into help/pictures, twice their size. Needs
Pillow (Debian: python3-pil). A dialog that does not open is skipped, with a message, and its old
picture stays.
"""

import json
import os
import subprocess
import sys
import tempfile
from dataclasses import dataclass, field
from pathlib import Path

from PIL import Image

ROOT = Path(__file__).resolve().parent.parent
RESOURCES = ROOT / "shell" / "res"
PICTURES = ROOT / "help" / "pictures"
SCALE = 2

WINDOW = (0, 0, 240, 294)
TABLE_TOP = 26  # the command bar stands above the table

HIT, STAND, DOUBLE, SPLIT, DEAL = (f"command {n}" for n in (32771, 32772, 32775, 32773, 32776))
GAME_SETUP, TABLE_SETUP, HIGH_SCORES, ABOUT, EXIT = (
    f"command {n}" for n in (32779, 32777, 32781, 57664, 57665))

VIDEO_POKER = {"GAME_TYPE": 1}
PLAIN = {"FANCYBJ": 0, "FANCYVP": 0}
SCORES = {"High0": "Hannah 412", "High1": "Old Tom 265", "High2": "Joe 150"}


@dataclass
class Scene:
    """One picture: what is done before it is taken, and what of the window it shows."""

    name: str
    lines: list
    crop: tuple = WINDOW
    settings: dict = field(default_factory=dict)
    is_dialog: bool = False


class NotThere(Exception):
    """A dialog that does not open."""


def table(left, top, right, bottom):
    """A part of the table, which is given without the command bar."""
    return (left, top + TABLE_TOP, right, bottom + TABLE_TOP)


def deal(*cards):
    """A deal of these cards: blackjack deals two to the player, then the dealer's hole card and up
    card; the rest are drawn in order."""
    return ["stack " + " ".join(map(str, cards)), DEAL]


def dialog(name, *lines, **settings):
    return Scene(name, list(lines), settings=settings, is_dialog=True)


ELEVEN_AGAINST_SIX = deal(34, 3, 23, 45, 49, 22)
PAIR_OF_EIGHTS = deal(47, 21, 10, 32, 29, 23)
TWO_PAIR = deal(4, 30, 22, 48, 38, 43)

SCENES = [
    Scene("table", ELEVEN_AGAINST_SIX),
    Scene("natural", deal(27, 52, 9, 21), table(0, 82, 240, 268)),
    Scene("insurance", deal(22, 46, 5, 40), table(0, 0, 240, 268)),
    Scene("split", PAIR_OF_EIGHTS + [SPLIT], table(0, 82, 240, 268)),
    Scene("advice", ELEVEN_AGAINST_SIX + ["key B"], table(0, 82, 240, 268)),
    Scene("dealer", ELEVEN_AGAINST_SIX + [DOUBLE], table(0, 0, 240, 66)),
    Scene("wrong_move", deal(49, 19, 7, 39) + [STAND], table(0, 82, 240, 268)),
    Scene("poker_marked", TWO_PAIR + ["key 5"], settings=VIDEO_POKER),
    Scene("poker_drawn", TWO_PAIR + ["key 5", "key Enter"], table(0, 216, 240, 268),
          settings=VIDEO_POKER),
    Scene("poker_plain", deal(28, 18, 50, 24, 13) + ["key 1", "key 2", "key 5"],
          settings=VIDEO_POKER | PLAIN),
    Scene("felt", ELEVEN_AGAINST_SIX, settings=PLAIN),
    Scene("menu", ["key Alt+B"], (0, 0, 240, 174), settings=SCORES),
    Scene("tool_hit", PAIR_OF_EIGHTS, (63, 2, 87, 24)),
    Scene("tool_stand", PAIR_OF_EIGHTS, (87, 2, 111, 24)),
    Scene("tool_double_down", PAIR_OF_EIGHTS, (116, 2, 140, 24)),
    Scene("tool_split", PAIR_OF_EIGHTS, (145, 2, 169, 24)),
    Scene("tool_deal", [], (174, 2, 198, 24)),
    Scene("tool_close", [], (219, 5, 237, 21)),
    Scene("button_poker_deal", TWO_PAIR + ["key Enter"], table(70, 180, 155, 215),
          settings=VIDEO_POKER),
    Scene("button_poker_play", TWO_PAIR, table(70, 180, 155, 215), settings=VIDEO_POKER),
    dialog("game_setup", GAME_SETUP),
    dialog("table_setup", TABLE_SETUP),
    dialog("edit_color", TABLE_SETUP, "press 1500"),
    dialog("high_scores", HIGH_SCORES, **SCORES),
    dialog("enter_name", "wallet 187.5", EXIT, "type Ann", **SCORES),
    dialog("about", ABOUT),
]

# Pictures of the game that stand alone in the pages, by the names of their files.
SINGLES = {
    "140_title": "title",
    "133_strategy": "button_strategy",
    "139_insurance": "button_insurance",
    "143_no_insurance": "button_no_insurance",
    "icon_136_bet_up": "button_bet_up",
    "icon_137_bet_down": "button_bet_down",
    "134_active_mark": "mark_active",
    "141_lamp_green": "lamp_green",
    "144_lamp_red": "lamp_red",
}


def write_settings(folder, settings):
    profile = folder / "Quillworks" / "Feltside.toml"
    profile.parent.mkdir()
    lines = [f"{key} = {json.dumps(value)}" for key, value in settings.items()]
    profile.write_text("\n".join(["[Settings]"] + lines) + "\n")


def answers_of(stylus, scene, folder, shot):
    write_settings(folder, scene.settings)
    lines = scene.lines + ["state", f"shot {shot}"]
    done = subprocess.run([stylus], input="\n".join(lines) + "\n", text=True, check=True,
                          capture_output=True, timeout=60,
                          env=os.environ | {"XDG_CONFIG_HOME": str(folder)})
    return [json.loads(line) for line in done.stdout.splitlines()]


def check(scene, answers):
    state = next((a for a in reversed(answers) if "windows" in a), {})
    if scene.is_dialog and (not state.get("running") or len(state["windows"]) < 2):
        raise NotThere
    for answer in answers:
        if "error" in answer or answer.get("refused"):
            raise NotThere if scene.is_dialog else SystemExit(f"{scene.name}: {answer}")


def take(stylus, scene):
    with tempfile.TemporaryDirectory() as folder:
        shot = Path(folder) / "shot.png"
        check(scene, answers_of(stylus, scene, Path(folder), shot))
        with Image.open(shot) as picture:
            return picture.convert("RGBA").crop(scene.crop)


def save(picture, name):
    size = (picture.width * SCALE, picture.height * SCALE)
    large = picture.convert("RGBA").resize(size, Image.Resampling.NEAREST)
    if large.getextrema()[3] == (255, 255):
        large = large.convert("RGB")
        colors = large.getcolors(256)
        if colors:
            large = large.quantize(len(colors), dither=Image.Dither.NONE)
    large.save(PICTURES / f"{name}.png", optimize=True)


def main():
    stylus = Path(sys.argv[1] if len(sys.argv) > 1 else ROOT / "build/play/feltside-stylus")
    if not stylus.is_file():
        raise SystemExit(f"{stylus} is not there: build the game first.")
    PICTURES.mkdir(exist_ok=True)
    for scene in SCENES:
        try:
            save(take(stylus.resolve(), scene), scene.name)
        except NotThere:
            print(f"skipped {scene.name}.png: the dialog does not open")
    backs = {path.stem: path.stem[len("054_"):] for path in RESOURCES.glob("0*_back_*.png")}
    for source, name in (SINGLES | backs).items():
        with Image.open(RESOURCES / f"{source}.png") as picture:
            save(picture, name)
    print(f"{len(list(PICTURES.glob('*.png')))} pictures in {PICTURES.relative_to(ROOT)}")


if __name__ == "__main__":
    main()
