#!/usr/bin/env python3
"""Writes PNG pictures as pixels that need no decoder: plain_picture.py FOLDER PICTURE...

A picture is its width and height, two bytes each with the lower one first; the number of its
colours less one; the colours as blue, green, red, alpha; and the number of a colour for every
pixel. A browser fetches these smaller than the pictures themselves, as they are squeezed together.
"""

import sys
from pathlib import Path

from PIL import Image


def plain(picture):
    pixels = list(picture.convert("RGBA").getdata())
    colours = sorted(set(pixels))
    numbers = {colour: number for number, colour in enumerate(colours)}
    red, green, blue, alpha = range(4)
    return (picture.width.to_bytes(2, "little") + picture.height.to_bytes(2, "little")
            + bytes([len(colours) - 1])
            + bytes(colour[part] for colour in colours for part in (blue, green, red, alpha))
            + bytes(numbers[pixel] for pixel in pixels))


def main():
    folder, *pictures = map(Path, sys.argv[1:])
    folder.mkdir(parents=True, exist_ok=True)
    for path in pictures:
        with Image.open(path) as picture:
            (folder / path.name).write_bytes(plain(picture))


if __name__ == "__main__":
    main()
