#!/usr/bin/env python3
"""Writes PNG pictures as pixels that need no decoder: plain_picture.py FOLDER PICTURE...

A picture is its width and height, two bytes each with the lower one first; the number of its
colours less one; the colours as blue, green, red, alpha; and from the top left the number of pixels
alike, at most 255, and of their colour, again and again. A browser fetches these smaller than the
pictures themselves, as they are squeezed together.
"""

import sys
from itertools import groupby
from pathlib import Path

from PIL import Image


def runs(numbers):
    """(how many alike, number) from the first to the last."""
    for number, alike in groupby(numbers):
        count = len(list(alike))
        while count > 0:
            yield min(count, 255), number
            count -= 255


def plain(picture):
    pixels = list(picture.convert("RGBA").getdata())
    colours = sorted(set(pixels))
    numbers = {colour: number for number, colour in enumerate(colours)}
    red, green, blue, alpha = range(4)
    return (picture.width.to_bytes(2, "little") + picture.height.to_bytes(2, "little")
            + bytes([len(colours) - 1])
            + bytes(colour[part] for colour in colours for part in (blue, green, red, alpha))
            + b"".join(map(bytes, runs(numbers[pixel] for pixel in pixels))))


def main():
    folder, *pictures = map(Path, sys.argv[1:])
    folder.mkdir(parents=True, exist_ok=True)
    for path in pictures:
        with Image.open(path) as picture:
            (folder / path.name).write_bytes(plain(picture))


if __name__ == "__main__":
    main()
