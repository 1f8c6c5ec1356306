#!/usr/bin/env python3
"""Takes the pictures of docs/ anew: tools/readme_pictures.py, after ./play has built the game.

Each is a picture of a session of tools/sessions/, every pixel drawn as a block of two by two. Needs
Pillow (Debian: python3-pil).
"""

import subprocess
from pathlib import Path

from PIL import Image

ROOT = Path(__file__).resolve().parent.parent
BUILD = ROOT / "build" / "play"
SCALE = 2
PICTURES = {
    "title.png": "blackjack_01_title.png",
    "blackjack.png": "blackjack_06_settled.png",
    "video_poker.png": "video_poker_04_drawn.png",
}


def main():
    subprocess.run([ROOT / "tools" / "play_sessions.sh", BUILD], check=True,
                   stdout=subprocess.DEVNULL)
    for name, shot in PICTURES.items():
        with Image.open(BUILD / "pictures" / shot) as picture:
            size = (picture.width * SCALE, picture.height * SCALE)
            colours = picture.convert("RGB").quantize(256, dither=Image.Dither.NONE)
            colours.resize(size, Image.Resampling.NEAREST).save(ROOT / "docs" / name, optimize=True)
            print(f"docs/{name}")


if __name__ == "__main__":
    main()
