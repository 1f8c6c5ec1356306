#!/usr/bin/python3
"""Makes every picture of the help pages again, from the game as it is built.

    tools/make_help_pictures.py [STYLUS]

plays the scenes below with the stylus program (default: the one that ./play builds) and writes them
into help/pictures, twice their size. Needs Pillow (Debian: python3-pil).
"""

import sys

from PIL import Image

from scenes import (ABOUT, DOUBLE, EXIT, GAME_SETUP, HIGH_SCORES, PLAIN, ROOT, SCORES, SPLIT,
                    STAND, TABLE_SETUP, VIDEO_POKER, Scene, deal, open_stylus, save, table, take)

RESOURCES = ROOT / "shell" / "res"
PICTURES = ROOT / "help" / "pictures"

ELEVEN_AGAINST_SIX = deal("8H 3C TD 6S TS 9D")
PAIR_OF_EIGHTS = deal("8S 8D TC 6H 3H TD")
TWO_PAIR = deal("4C 4H 9D 9S QH 4S")

SCENES = [
    Scene("table", ELEVEN_AGAINST_SIX),
    Scene("natural", deal("AH KS 9C 8D"), table(0, 82, 240, 268)),
    Scene("insurance", deal("9D 7S 5C AS"), table(0, 0, 240, 268)),
    Scene("split", PAIR_OF_EIGHTS + [SPLIT], table(0, 82, 240, 268)),
    Scene("advice", ELEVEN_AGAINST_SIX + ["key B"], table(0, 82, 240, 268)),
    Scene("dealer", ELEVEN_AGAINST_SIX + [DOUBLE], table(0, 0, 240, 66)),
    Scene("wrong_move", deal("TS 6D 7C KH") + [STAND], table(0, 82, 240, 268)),
    Scene("poker_marked", TWO_PAIR + ["key 5"], settings=VIDEO_POKER),
    Scene("poker_drawn", TWO_PAIR + ["key 5", "key Enter"], table(0, 216, 240, 268),
          settings=VIDEO_POKER),
    Scene("poker_plain", deal("2H 5D JS JD KC") + ["key 1", "key 2", "key 5"],
          settings=VIDEO_POKER | PLAIN),
    Scene("felt", ELEVEN_AGAINST_SIX, settings=PLAIN),
    Scene("menu", ["key Alt+B"], (0, 0, 240, 174), SCORES, top="BlackJack"),
    Scene("tool_hit", PAIR_OF_EIGHTS, (63, 2, 87, 24)),
    Scene("tool_stand", PAIR_OF_EIGHTS, (87, 2, 111, 24)),
    Scene("tool_double_down", PAIR_OF_EIGHTS, (116, 2, 140, 24)),
    Scene("tool_split", PAIR_OF_EIGHTS, (145, 2, 169, 24)),
    Scene("tool_deal", [], (174, 2, 198, 24)),
    Scene("tool_close", [], (219, 5, 237, 21)),
    Scene("button_poker_deal", TWO_PAIR + ["key Enter"], table(70, 180, 155, 215),
          settings=VIDEO_POKER),
    Scene("button_poker_play", TWO_PAIR, table(70, 180, 155, 215), settings=VIDEO_POKER),
    Scene("game_setup", [GAME_SETUP], top="Setup"),
    Scene("table_setup", [TABLE_SETUP], top="Setup Table"),
    Scene("edit_color", [TABLE_SETUP, "press 1500"], top="Edit RGB Color"),
    Scene("high_scores", [HIGH_SCORES], settings=SCORES, top="High Scores"),
    Scene("enter_name", ["wallet 187.5", EXIT, "type Ann"], settings=SCORES, top="High Scores"),
    Scene("about", [ABOUT], top="About Feltside"),
]

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
    for scene in SCENES:
        save(take(stylus, scene), PICTURES / f"{scene.name}.png")
    backs = {path.stem: path.stem[len("054_"):] for path in RESOURCES.glob("0*_back_*.png")}
    for source, name in (SINGLES | backs).items():
        with Image.open(RESOURCES / f"{source}.png") as picture:
            save(picture, PICTURES / f"{name}.png")
    print(f"{len(list(PICTURES.glob('*.png')))} pictures in {PICTURES.relative_to(ROOT)}")


if __name__ == "__main__":
    main()
