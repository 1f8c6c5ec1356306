"""A small canvas of palette colours, and how it becomes an indexed PNG."""

from pathlib import Path

from PIL import Image

from palette import PALETTE

_ORDER = {name: place for place, name in enumerate(PALETTE)}


class Canvas:
    """A rectangle of pixels, each holding the name of a palette colour.

    Drawing outside the canvas is ignored, so that a figure may hang over an edge.
    """

    def __init__(self, width, height, fill="white"):
        _check(fill)
        self.width = width
        self.height = height
        self._pixels = [fill] * (width * height)

    def contains(self, x, y):
        return 0 <= x < self.width and 0 <= y < self.height

    def get(self, x, y):
        """The colour name at a pixel of the canvas; an IndexError outside it."""
        if not self.contains(x, y):
            raise IndexError(f"({x}, {y}) is outside {self.width} x {self.height}")
        return self._pixels[y * self.width + x]

    def put(self, x, y, name):
        _check(name)
        if self.contains(x, y):
            self._pixels[y * self.width + x] = name

    def rect(self, x0, y0, x1, y1, name):
        """Fills a rectangle; x1 and y1 stand just outside it."""
        for y in range(y0, y1):
            for x in range(x0, x1):
                self.put(x, y, name)

    def line(self, x0, y0, x1, y1, name):
        """Draws a line of single pixels, both ends included."""
        dx, dy = abs(x1 - x0), -abs(y1 - y0)
        step_x, step_y = (1 if x0 < x1 else -1), (1 if y0 < y1 else -1)
        error = dx + dy
        while True:
            self.put(x0, y0, name)
            if (x0, y0) == (x1, y1):
                return
            doubled = 2 * error
            if doubled >= dy:
                error += dy
                x0 += step_x
            if doubled <= dx:
                error += dx
                y0 += step_y

    def blit(self, other, x, y, transparent=None):
        """Copies another canvas; its pixels of the colour `transparent` leave what is there."""
        for row in range(other.height):
            for column in range(other.width):
                name = other.get(column, row)
                if name != transparent:
                    self.put(x + column, y + row, name)

    def text_grid(self, x, y, lines, mapping):
        """Draws rows of characters, each through `mapping` to a colour name; a space leaves."""
        for row, line in enumerate(lines):
            for column, character in enumerate(line):
                if character != " ":
                    self.put(x + column, y + row, mapping[character])

    def rotated180(self):
        """A copy turned upside down."""
        turned = Canvas(self.width, self.height)
        turned._pixels = self._pixels[::-1]
        return turned

    def colours(self):
        """The names of the colours used, in palette order."""
        return sorted(set(self._pixels), key=_ORDER.__getitem__)

    def save(self, path, max_colours, transparent=None):
        """Writes an indexed PNG with just the colours used, in palette order.

        `transparent` names the colour that becomes fully transparent. Raises ValueError if there
        are more than `max_colours`. The same canvas always gives the same bytes.
        """
        used = self.colours()
        if len(used) > max_colours:
            raise ValueError(f"{path}: {len(used)} colours, {max_colours} allowed: {used}")
        place = {name: index for index, name in enumerate(used)}
        image = Image.new("P", (self.width, self.height))
        image.putpalette([part for name in used for part in PALETTE[name]])
        image.putdata([place[name] for name in self._pixels])
        options = {"transparency": place[transparent]} if transparent in place else {}
        Path(path).parent.mkdir(parents=True, exist_ok=True)
        image.save(path, "PNG", optimize=False, compress_level=9, **options)


def read_grids(path):
    """Reads a text file of named character grids: {name: [line, ...]}.

    A line `[name]` opens a grid, the lines up to the next one are its rows. Lines that begin with
    `;` and empty lines are skipped; `.` may stand for a space, so that rows keep their visible
    width.
    """
    grids = {}
    rows = None
    for line in Path(path).read_text(encoding="utf-8").splitlines():
        if not line.strip() or line.startswith(";"):
            continue
        if line.startswith("[") and line.rstrip().endswith("]"):
            rows = grids.setdefault(line.strip()[1:-1], [])
        elif rows is None:
            raise ValueError(f"{path}: a row stands before the first [name]: {line!r}")
        else:
            rows.append(line.rstrip().replace(".", " "))
    return grids


def _check(name):
    if name not in PALETTE:
        raise ValueError(f"the palette has no colour {name!r}")
