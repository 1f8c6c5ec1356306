#!/usr/bin/env python3
"""Makes every picture of the help pages again, from the game as it is built.

    tools/make_help_pictures.py [STYLUS]

plays the scenes of scenes.txt with the stylus program (default: the one that ./play builds) and
writes them into help/pictures, twice their size. Needs Pillow (Debian: python3-pil).
"""

import sys

from PIL import Image

from scenes import ROOT, open_stylus, read_scenes, save, take

RESOURCES = ROOT / "shell" / "res"
PICTURES = ROOT / "help" / "pictures"

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


def main():
    stylus = open_stylus(sys.argv[1] if len(sys.argv) > 1 else None)
    PICTURES.mkdir(exist_ok=True)
    for scene in read_scenes().values():
        if scene.parts:
            picture = take(stylus, scene)
            for name, part in scene.parts.items():
                save(picture.crop(part), PICTURES / f"{name}.png")
    backs = {path.stem: path.stem[len("054_"):] for path in RESOURCES.glob("0*_back_*.png")}
    for source, name in (SINGLES | backs).items():
        with Image.open(RESOURCES / f"{source}.png") as picture:
            save(picture, PICTURES / f"{name}.png")
    print(f"{len(list(PICTURES.glob('*.png')))} pictures in {PICTURES.relative_to(ROOT)}")


if __name__ == "__main__":
    main()
