"""Takes pictures of the game as it is built: a scene is played with the stylus program, from a
fresh start with settings of its own, and what its window then shows is the picture.

For the scripts that make pictures; needs Pillow (Debian: python3-pil).
"""

import json
import os
import subprocess
import tempfile
from dataclasses import dataclass, field
from pathlib import Path

from PIL import Image

ROOT = Path(__file__).resolve().parent.parent
STYLUS = ROOT / "build" / "play" / "feltside-stylus"
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
    top: str = "Feltside"  # the title of the window that must then be on top


def table(left, top, right, bottom):
    """A part of the table, which is given without the command bar."""
    return (left, top + TABLE_TOP, right, bottom + TABLE_TOP)


def deal(cards):
    """A deal of cards such as "AS TH 2D": blackjack deals two to the player, then the dealer's hole
    card and up card; the rest are drawn in order."""
    numbers = ("CDHS".index(suit) * 13 + "A23456789TJQK".index(rank) + 1
               for rank, suit in cards.split())
    return ["stack " + " ".join(map(str, numbers)), DEAL]


def open_stylus(argument):
    """The stylus program of a command line, or the one that ./play builds."""
    stylus = Path(argument or STYLUS)
    if not stylus.is_file():
        raise SystemExit(f"{stylus} is not there: build the game first.")
    return stylus.resolve()


def write_settings(folder, settings):
    profile = folder / "Quillworks" / "Feltside.toml"
    profile.parent.mkdir()
    lines = [f"{key} = {json.dumps(value)}" for key, value in settings.items()]
    profile.write_text("\n".join(["[Settings]"] + lines) + "\n")


def play(stylus, scene, folder, shot):
    write_settings(folder, scene.settings)
    lines = scene.lines + [f"shot {shot}", "state"]
    done = subprocess.run([stylus], input="\n".join(lines) + "\n", text=True, check=True,
                          capture_output=True, timeout=60,
                          env=os.environ | {"XDG_CONFIG_HOME": str(folder)})
    answers = [json.loads(line) for line in done.stdout.splitlines()]
    for answer in answers:
        if "error" in answer or answer.get("refused"):
            raise SystemExit(f"{scene.name}: {answer}")
    top = answers[len(lines) - 1]["windows"][-1]
    if top != scene.top:
        raise SystemExit(f"{scene.name}: \"{top}\" is on top, not \"{scene.top}\"")


def take(stylus, scene):
    with tempfile.TemporaryDirectory() as folder:
        shot = Path(folder) / "shot.png"
        play(stylus, scene, Path(folder), shot)
        with Image.open(shot) as picture:
            return picture.convert("RGBA").crop(scene.crop)


def indexed(picture):
    """The same picture with a palette, every colour just as it was; None for too many colours."""
    found = picture.getcolors(256)
    if found is None:
        return None
    colors = sorted(color for _, color in found)
    places = {color: place for place, color in enumerate(colors)}
    small = Image.new("P", picture.size)
    small.putpalette([part for color in colors for part in color])
    small.putdata([places[color] for color in picture.getdata()])
    return small


def save(picture, file):
    """Writes a picture, every pixel of it as a block, with a palette where it can have one."""
    size = (picture.width * SCALE, picture.height * SCALE)
    picture = picture.convert("RGBA")
    if picture.getextrema()[3] == (255, 255):
        picture = picture.convert("RGB")
        picture = indexed(picture) or picture
    picture.resize(size, Image.Resampling.NEAREST).save(file, optimize=True)
