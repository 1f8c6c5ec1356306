"""Drawing with soft edges that stays within the palette."""

import math

import shapes
from palette import PALETTE

# Ramps for one picture each, and tints that would colour the grey edge of a white card.
_KEPT_OUT = {"paper", "night", "violet", "nothing", "mark", "steel", "purple"}
_BLENDS = [name for name in PALETTE if name.split("_")[0] not in _KEPT_OUT]


class Scene:
    """Lays shapes on a canvas; a pixel that a shape half fills takes the nearest palette colour."""

    def __init__(self, canvas):
        self._canvas = canvas
        self._nearest = {}

    def lay(self, shape, colour):
        """`shape` tests a point; `colour` is a name, or gives the name at a point."""
        pick = colour if callable(colour) else lambda x, y: colour
        for y in range(self._canvas.height):
            for x in range(self._canvas.width):
                inside = [point for point in shapes.samples(x, y) if shape(*point)]
                if inside:
                    self._blend(x, y, [pick(*point) for point in inside])

    def _blend(self, x, y, names):
        ground = self._canvas.get(x, y)
        parts = names + [ground] * (shapes.GRAIN**2 - len(names))
        if len(set(parts)) == 1:
            self._canvas.put(x, y, parts[0])
            return
        mean = tuple(sum(PALETTE[name][channel] for name in parts) // len(parts)
                     for channel in range(3))
        if mean not in self._nearest:
            self._nearest[mean] = min(_BLENDS, key=lambda name: math.dist(PALETTE[name], mean))
        self._canvas.put(x, y, self._nearest[mean])
