#!/usr/bin/env python3
"""Makes every picture of the game again, byte for byte: `python3 art/make.py`.

Needs Python 3.9 or later and Pillow (Debian: python3-pil).
"""

import sys
from pathlib import Path

sys.dont_write_bytecode = True

import backs
import cards
import contact_sheet
import icons
import pictures

ROOT = Path(__file__).resolve().parent.parent
RESOURCES = ROOT / "shell" / "res"


def main():
    cards.make_all(RESOURCES)
    backs.make_all(RESOURCES)
    pictures.make_all(RESOURCES)
    icons.make_editions(ROOT / "editions")
    contact_sheet.make(RESOURCES, ROOT / "art" / "contact_sheet.png")


if __name__ == "__main__":
    main()
