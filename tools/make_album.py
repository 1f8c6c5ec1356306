#!/usr/bin/env python3
"""Makes the album of every screen of the game anew, in docs/album; the README shows some of it.

    tools/make_album.py [--stylus FILE]
    tools/make_album.py [--stylus FILE] --vision KIND --into FOLDER

plays the scenes of scenes.txt with the stylus program (default: the one that ./play builds).
With --vision the album is shown as people with that kind of colour blindness see it, for looking
at: whatever the game tells by a colour must still be told. Needs Pillow (Debian: python3-pil).
"""

import argparse
import html
from pathlib import Path

from scenes import ROOT, SCALE, indexed, open_stylus, read_scenes, save, take

ALBUM = ROOT / "docs" / "album"
# Taken by take_browser_pictures.py.
BROWSER = {
    "desktop": "In a browser on a desktop.",
    "phone": "On a phone.",
    "phone_lying": "On a phone on its side.",
    "phone_typing": "A name is typed: the keyboard lies below the picture.",
    "ended": "After Exit.",
}

# What is left of red, green and blue (linear) where one kind of cone is missing. The figures are
# those for severity 1.0 in G. M. Machado, M. M. Oliveira, L. A. F. Fernandes: A Physiologically-
# based Model for Simulation of Color Vision Deficiency, IEEE Transactions on Visualization and
# Computer Graphics 15 (6), 2009.
VISIONS = {
    "protanopia": ((0.152286, 1.052583, -0.204868),
                   (0.114503, 0.786281, 0.099216),
                   (-0.003882, -0.048116, 1.051998)),
    "deuteranopia": ((0.367322, 0.860646, -0.227968),
                     (0.280085, 0.672501, 0.047413),
                     (-0.011820, 0.042940, 0.968881)),
    "tritanopia": ((1.255528, -0.076749, -0.178779),
                   (-0.078411, 0.930809, 0.147602),
                   (0.004733, 0.691367, 0.303900)),
}

STYLE = """\
body { margin: 2em auto; max-width: 78em; padding: 0 1em; font: 16px/1.45 sans-serif;
       color: #222; background: #f4f2ec; }
section { display: flex; flex-wrap: wrap; gap: 1.5em; }
figure { margin: 0; width: 480px; }
img { display: block; image-rendering: pixelated; }
figure.page img { max-width: 100%; max-height: 588px; image-rendering: auto; }
figcaption { margin-top: 0.3em; }
@media (max-width: 520px) { figure, img { width: 100%; height: auto; } }
"""


def to_linear(part):
    """One component 0..255 of an sRGB colour as light, 0..1."""
    part /= 255
    return part / 12.92 if part <= 0.04045 else ((part + 0.055) / 1.055) ** 2.4


def from_linear(light):
    light = min(1, max(0, light))
    part = light * 12.92 if light <= 0.0031308 else 1.055 * light ** (1 / 2.4) - 0.055
    return round(part * 255)


def seen_as(matrix, color):
    light = [to_linear(part) for part in color]
    return [from_linear(sum(share * part for share, part in zip(row, light))) for row in matrix]


def filtered(picture, matrix):
    seen = indexed(picture.convert("RGB"))
    palette = seen.getpalette()
    colors = [palette[i:i + 3] for i in range(0, len(palette), 3)]
    seen.putpalette([part for color in colors for part in seen_as(matrix, color)])
    return seen


def figure(scene, size):
    text = html.escape(scene.caption)
    return (f'<figure><img src="{scene.name}.png" width="{size[0]}" height="{size[1]}" alt="">'
            f"<figcaption>{text}</figcaption></figure>")


def browser_figure(name):
    return (f'<figure class="page"><img src="browser/{name}.png" alt="">'
            f"<figcaption>{BROWSER[name]}</figcaption></figure>")


def write_page(folder, figures, vision):
    title = "Feltside: every screen" + (f", seen with {vision}" if vision else "")
    lines = ["<!DOCTYPE html>", '<html lang="en">', '<meta charset="utf-8">',
             '<meta name="viewport" content="width=device-width">', f"<title>{title}</title>",
             f"<style>\n{STYLE}</style>", f"<h1>{title}</h1>"]
    for heading, below in figures.items():
        lines += [f"<h2>{heading}</h2>", "<section>", *below, "</section>"]
    if folder == ALBUM:
        lines += ["<h2>On a page of a browser</h2>", "<section>", *map(browser_figure, BROWSER),
                  "</section>"]
    (folder / "index.html").write_text("\n".join(lines) + "\n")


def empty(folder):
    """Makes the folder and clears it of the pictures of scenes that are no more."""
    folder.mkdir(parents=True, exist_ok=True)
    for picture in folder.glob("*.png"):
        picture.unlink()


def make(stylus, folder, vision):
    empty(folder)
    figures = {}
    for scene in read_scenes().values():
        if not scene.caption:
            continue
        picture = take(stylus, scene)
        if vision:
            picture = filtered(picture, VISIONS[vision])
        save(picture, folder / f"{scene.name}.png")
        size = (picture.width * SCALE, picture.height * SCALE)
        figures.setdefault(scene.chapter, []).append(figure(scene, size))
    write_page(folder, figures, vision)
    print(f"{sum(map(len, figures.values()))} pictures in {folder}")


def main():
    parser = argparse.ArgumentParser(description="Makes the album of every screen.")
    parser.add_argument("--stylus", metavar="FILE", help="the stylus program to play with")
    parser.add_argument("--vision", choices=VISIONS, help="a kind of colour blindness")
    parser.add_argument("--into", metavar="FOLDER", type=Path, help="where that album is to go")
    options = parser.parse_args()
    if (options.vision is None) != (options.into is None):
        parser.error("--vision and --into go together")
    make(open_stylus(options.stylus), options.into or ALBUM, options.vision)


if __name__ == "__main__":
    main()
