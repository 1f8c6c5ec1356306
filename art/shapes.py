"""Suits and other shapes as tests of a point, and how they are laid on pixels with soft edges.

A suit is given in units of its own half height: it spans -1..1 from top to bottom, y grows
downwards, and the middle of it is (0, 0).
"""

import math

# Samples across one pixel, along each axis.
GRAIN = 4
_OFFSETS = [(step + 0.5) / GRAIN for step in range(GRAIN)]


def diamond(x, y):
    return abs(x) / 0.74 + abs(y) < 1 + 0.12 * (abs(x) - 0.4) * abs(x)


def _lobes_and_tip(x, y, curve):
    """Two lobes above a tip; a `curve` beyond 1 hollows the sides towards the tip."""
    if math.hypot(abs(x) - 0.46, y + 0.42) < 0.5:
        return True
    return -0.42 <= y < 1 and abs(x) < 0.96 * ((1 - y) / 1.42) ** curve


def heart(x, y):
    return _lobes_and_tip(x, y, 0.85)


def _stem(x, y):
    return 0.1 < y < 1 and abs(x) < 0.07 + 0.34 * max(0.0, (y - 0.4) / 0.6) ** 2


def spade(x, y):
    return _lobes_and_tip(x / 0.92, -(y + 0.14) / 0.86, 1.12) or _stem(x, y)


def club(x, y):
    if math.hypot(x, y + 0.54) < 0.44 or math.hypot(abs(x) - 0.5, y - 0.12) < 0.44:
        return True
    return _stem(x, y) or (abs(x) < 0.2 and -0.5 < y < 0.4)


SUITS = (spade, heart, club, diamond)


def placed(shape, x, y, half_height):
    """The shape moved to (x, y) and scaled."""
    return lambda px, py: shape((px - x) / half_height, (py - y) / half_height)


def ring(x, y, inner, outer):
    return lambda px, py: inner <= math.hypot(px - x, py - y) < outer


def disc(x, y, radius):
    return lambda px, py: math.hypot(px - x, py - y) < radius


def distance(x, y, start, end):
    """From a point to the piece of line between two points."""
    (x0, y0), (x1, y1) = start, end
    dx, dy = x1 - x0, y1 - y0
    along = ((x - x0) * dx + (y - y0) * dy) / (dx * dx + dy * dy)
    along = min(1.0, max(0.0, along))
    return math.hypot(x - x0 - along * dx, y - y0 - along * dy)


def samples(x, y):
    """Points spread evenly over the pixel at (x, y)."""
    return [(x + dx, y + dy) for dy in _OFFSETS for dx in _OFFSETS]


def coverage(shape, x, y):
    """How much of the pixel at (x, y) the shape fills, 0 to 1."""
    return sum(shape(*point) for point in samples(x, y)) / GRAIN**2
