"""The colours of the pictures other than cards: buttons, tables, title and icons.

Most stand in ramps, from dark to light, so that a drawing can ask for "a step lighter".
"""


def _ramp(name, count, *stops):
    """`count` colours named name_0, name_1 ... evenly spread between the stops."""
    colours = {}
    for step in range(count):
        place = step * (len(stops) - 1) / (count - 1)
        low = min(int(place), len(stops) - 2)
        part = place - low
        colours[f"{name}_{step}"] = tuple(
            round(a + (b - a) * part) for a, b in zip(stops[low], stops[low + 1])
        )
    return colours


SCENE_PALETTE = {
    # Stands for "no pixel" where a picture is transparent. The dark of the felt's rim: where a
    # desktop scales an icon smoothly, a trace of it may show.
    "nothing": (0x04, 0x30, 0x1A),
    # The one grey of everything that can be pressed; its edges are white, grey_80 and grey_40.
    "button_face": (0xD4, 0xD0, 0xC8),
    # The game lays the mark over the table with AND: pure red keeps exactly the red part.
    "mark_red": (0xFF, 0x00, 0x00),
    # What the lamps are set into: the player box, in its colour until a player changes it.
    "player_box": (135, 180, 100),
    "lamp_green_ring": (0x00, 0x38, 0x10),
    "lamp_green_shade": (0x00, 0x70, 0x18),
    "lamp_green_body": (0x00, 0x98, 0x30),
    "lamp_green_glow": (0x30, 0xC8, 0x50),
    "lamp_green_gleam": (0xC0, 0xFF, 0xC0),
    "lamp_red_ring": (0x60, 0x00, 0x08),
    "lamp_red_shade": (0xA0, 0x00, 0x10),
    "lamp_red_body": (0xD8, 0x08, 0x08),
    "lamp_red_glow": (0xFF, 0x38, 0x30),
    "lamp_red_gleam": (0xFF, 0xC0, 0xB8),
    # The plus on the tool bar.
    "hit_green": (0x00, 0x80, 0x28),
    # Paper of the blackjack table. Nothing darker: texts in dark red and black lie on it.
    **{f"paper_{level}": (level, level, level) for level in range(226, 255)},
    # Felt, wood and brass of the title picture.
    **_ramp("felt", 9, (4, 48, 26), (14, 104, 52), (96, 190, 96)),
    **_ramp("wood", 7, (44, 18, 12), (132, 66, 30), (226, 164, 96)),
    **_ramp("brass", 7, (92, 48, 8), (222, 160, 32), (255, 246, 190)),
    # Blues of the video-poker cabinet.
    **_ramp("night", 21, (3, 8, 30), (10, 34, 92), (34, 92, 172), (150, 200, 244), (240, 248, 255)),
    # Edges of the violet button, whose face is the colour of the text's cell.
    "violet_dark": (38, 6, 72),
    "violet_light": (134, 76, 200),
    "violet_pale": (196, 156, 240),
}
