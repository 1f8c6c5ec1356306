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
SCENES = ROOT / "tools" / "scenes.txt"
STYLUS = ROOT / "build" / "play" / "feltside-stylus"
SCALE = 2


@dataclass
class Scene:
    """A screen of the game, as tools/scenes.txt says how it comes about and what it is for."""

    name: str
    chapter: str
    caption: str = ""  # in the album; empty: it is not there
    settings: list = field(default_factory=list)
    lines: list = field(default_factory=list)  # for the stylus program
    parts: dict = field(default_factory=dict)  # for the help pages: rectangles in the window

    def begin_with(self, other):
        self.settings += other.settings
        self.lines += other.lines

    def add(self, line):
        word, _, rest = line.partition(" ")
        if word == "album":
            self.caption = rest
        elif word == "settings":
            self.settings += rest.split("; ")
        elif word == "help-picture":
            name, *corners = rest.split()
            self.parts[name] = tuple(map(int, corners))
        elif word not in ("golden", "reads"):
            self.lines.append(line)


def read_scenes():
    """All scenes, by their names."""
    scenes, chapter, scene = {}, "", None
    for line in SCENES.read_text(encoding="utf-8").splitlines():
        word, _, rest = line.partition(" ")
        if word == "chapter":
            chapter = rest
        elif word == "==":
            scene = scenes[rest] = Scene(rest, chapter)
        elif word == "from":
            scene.begin_with(scenes[rest])
        elif line and line[0] != ";":
            scene.add(line)
    return scenes


def open_stylus(argument):
    """The stylus program of a command line, or the one that ./play builds."""
    stylus = Path(argument or STYLUS)
    if not stylus.is_file():
        raise SystemExit(f"{stylus} is not there: build the game first.")
    return stylus.resolve()


def play(stylus, scene, folder, shot):
    profile = folder / "Quillworks" / "Feltside.toml"
    profile.parent.mkdir()
    profile.write_text("\n".join(["[Settings]"] + scene.settings) + "\n", encoding="utf-8")
    done = subprocess.run([stylus], input="\n".join(scene.lines + [f"shot {shot}"]) + "\n",
                          encoding="utf-8", check=True, capture_output=True, timeout=60,
                          env=os.environ | {"XDG_CONFIG_HOME": str(folder)})
    for answer in map(json.loads, done.stdout.splitlines()):
        if "error" in answer or answer.get("refused"):
            raise SystemExit(f"{scene.name}: {answer}")


def take(stylus, scene):
    """What the window shows at the end of the scene."""
    with tempfile.TemporaryDirectory() as folder:
        shot = Path(folder) / "shot.png"
        play(stylus, scene, Path(folder), shot)
        with Image.open(shot) as picture:
            return picture.convert("RGBA")


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
