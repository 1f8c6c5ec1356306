"""Words in the hand-made letters of art/sources/pictures."""

from pathlib import Path

import shapes
from pixels import read_grids

_SOURCES = Path(__file__).resolve().parent / "sources" / "pictures"


class Face:
    """A set of letters from one file, set with `gap` empty columns between them."""

    def __init__(self, file, gap=1, blank=3):
        self._letters = read_grids(_SOURCES / file)
        self._gap = gap
        self._blank = blank

    def width(self, text):
        return sum(self._advance(letter) for letter in text) - self._gap

    def pixels(self, text):
        """The inked pixels (x, y) of a word whose top left stands at (0, 0)."""
        x = 0
        for letter in text:
            for y, row in enumerate(self._letters.get(letter, [])):
                yield from ((x + column, y) for column, ink in enumerate(row) if ink == "#")
            x += self._advance(letter)

    def write(self, canvas, x, y, text, name):
        for column, row in self.pixels(text):
            canvas.put(x + column, y + row, name)

    def write_centred(self, canvas, left, right, y, text, name):
        self.write(canvas, (left + right - self.width(text)) // 2, y, text, name)

    def write_right(self, canvas, right, y, text, name):
        self.write(canvas, right - self.width(text), y, text, name)

    def _advance(self, letter):
        if letter == " ":
            return self._blank + self._gap
        return max(map(len, self._letters[letter])) + self._gap


class BoldFace(Face):
    """The same letters drawn twice, a pixel apart."""

    def pixels(self, text):
        thin = list(super().pixels(text))
        return sorted({*thin, *((x + 1, y) for x, y in thin)})

    def _advance(self, letter):
        return super()._advance(letter) + (letter != " ")


PLAIN = Face("letters_plain.txt")
BOLD = BoldFace("letters_plain.txt")
TINY = Face("letters_tiny.txt")
LOGO = Face("letters_logo.txt")


def _read_strokes():
    """{letter: [stroke, ...]}, a stroke being a list of points."""
    letters = {}
    for line in (_SOURCES / "strokes.txt").read_text(encoding="utf-8").splitlines():
        if line.startswith("["):
            strokes = letters.setdefault(line[1], [])
        elif line and not line.startswith(";"):
            strokes.append([tuple(map(float, point.split(","))) for point in line.split()])
    return letters


_STROKES = _read_strokes()


def stroke_width(letter):
    return max(x for stroke in _STROKES[letter] for x, _ in stroke)


def stroked(letter, half_stroke):
    """A test of a point on the strokes' own grid: whether the letter's ink covers it."""
    lines = [pair for stroke in _STROKES[letter] for pair in zip(stroke, stroke[1:])]
    return lambda x, y: any(shapes.distance(x, y, *line) < half_stroke for line in lines)
