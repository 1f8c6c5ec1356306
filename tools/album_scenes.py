"""What the album shows: for each screen of the game how it comes about, and what is to be seen."""

from scenes import (ABOUT, DOUBLE, EXIT, GAME_SETUP, HIGH_SCORES, HIT, PLAIN, SCORES, SPLIT, STAND,
                    TABLE_SETUP, VIDEO_POKER, Scene, deal)

ALWAYS_ADVICE = {"STRATTYPE": 2}
NO_ADVICE = {"STRATTYPE": 0}
PLAIN_POKER = VIDEO_POKER | PLAIN

SIXTEEN = deal("TH 6D KS 7C 4D 2S")
ELEVEN = deal("8H 3C TD 6S TS 9D")
INSURANCE = deal("9D 7S 5C AS 2H 3C")
EIGHTS = deal("8C 8D TS 6H 3S TH KD 9C")
PAIR = deal("9C 9H 9S 4S KC 4H 4D")
NOTHING = deal("2H 5D JS 8D KC 3C 7S")
MARK_TWO = ["key 4", "key 5"]
DRAW = "key Enter"
COLORS = [TABLE_SETUP, "press 1500"]
ENTRY = ["wallet 187.5", EXIT]


def setup_list(control):
    return Scene(f"setup_list_{control}", [GAME_SETUP, f"press {control}"], top="")


TITLE = [
    (Scene("title", []), "Before the first deal."),
]

BLACKJACK = [
    (Scene("dealt", SIXTEEN), "Dealt: the question mark gives advice."),
    (Scene("advice_on_request", SIXTEEN + ["key B"]), "Advice, asked for."),
    (Scene("advice_always", ELEVEN, settings=ALWAYS_ADVICE), "Advice, always shown."),
    (Scene("no_advice", deal("2H 3S TC 7D 2D 4C 5C") + [HIT] * 3, settings=NO_ADVICE),
     "Five cards, without any advice."),
    (Scene("lamp_green", SIXTEEN + [HIT]), "The green lamp: that was right."),
    (Scene("lamp_red", deal("TS 3D KH 6C 5D") + [HIT]), "The red lamp: that was wrong."),
    (Scene("insurance", INSURANCE), "The insurance question."),
    (Scene("insurance_advice", INSURANCE, settings=ALWAYS_ADVICE),
     "The insurance question with advice."),
    (Scene("split_first", EIGHTS + [SPLIT]), "Split: the first hand is played."),
    (Scene("split_second", EIGHTS + [SPLIT, DOUBLE]),
     "The first hand doubled: the second is played."),
    (Scene("split_settled", EIGHTS + [SPLIT, DOUBLE, STAND]), "Both hands settled."),
    (Scene("doubled", ELEVEN + [DOUBLE]), "Doubled, and won."),
    (Scene("won", deal("TH 9D TS 8C") + [STAND]), "Won."),
    (Scene("lost", deal("TS 8D KH 9C") + [STAND]), "Lost."),
    (Scene("bust", deal("TC 6D KH 9C QS") + [HIT]), "Lost by a card too many."),
    (Scene("push", deal("QH 9S JD 9C") + [STAND]), "A push."),
    (Scene("natural", deal("AH KS 9C 8D")), "A natural."),
    (Scene("dealer_natural", deal("QH 9S KD AC") + ["key I"]),
     "The dealer's natural, and the player insured."),
    (Scene("negative_wallet", ["wallet -5.5"] + deal("TH 8D KS 9C") + [STAND]),
     "A wallet below zero."),
]

PLAIN_BLACKJACK = [
    (Scene("plain_dealt", SIXTEEN, settings=PLAIN), "Dealt, on plain felt."),
    (Scene("plain_insurance", INSURANCE + ["key B"], settings=PLAIN),
     "The insurance question, with advice asked for."),
    (Scene("plain_split_first", EIGHTS + [SPLIT], settings=PLAIN),
     "Split: the first hand is played."),
    (Scene("plain_split_second", EIGHTS + [SPLIT, STAND], settings=PLAIN),
     "Split: the second hand is played."),
    (Scene("plain_settled", deal("TS 8D KH 9C") + [STAND], settings=PLAIN), "Settled."),
]

POKER = [
    (Scene("poker_dealt", PAIR, settings=VIDEO_POKER), "Dealt."),
    (Scene("poker_marked", PAIR + MARK_TWO, settings=VIDEO_POKER), "Two cards marked."),
    (Scene("poker_drawn", PAIR + MARK_TWO + [DRAW], settings=VIDEO_POKER), "Drawn, and won."),
    (Scene("poker_lost", NOTHING + MARK_TWO + [DRAW], settings=VIDEO_POKER), "Drawn, and lost."),
    (Scene("poker_negative_wallet", ["wallet -12"] + PAIR, settings=VIDEO_POKER),
     "A wallet below zero."),
]

PLAIN_POKER_SCENES = [
    (Scene("plain_poker_dealt", PAIR, settings=PLAIN_POKER), "Dealt."),
    (Scene("plain_poker_marked", PAIR + MARK_TWO, settings=PLAIN_POKER), "Two cards marked."),
    (Scene("plain_poker_drawn", PAIR + MARK_TWO + [DRAW], settings=PLAIN_POKER),
     "Drawn, and won."),
    (Scene("plain_poker_negative_wallet", ["wallet -12"] + PAIR, settings=PLAIN_POKER),
     "A wallet below zero."),
    (Scene("plain_poker_picture", PAIR + MARK_TWO + [DRAW],
           settings=VIDEO_POKER | {"FANCYVP": 0}),
     "Plain video poker on the blackjack picture."),
]

MENU = [
    (Scene("menu", ["touch 30 12"], settings=SCORES, top="BlackJack"),
     "The menu, every item enabled."),
    (Scene("menu_disabled", SIXTEEN + ["key Alt+B", "key Down"], top="BlackJack"),
     "During a hand and before the first high score: two items disabled."),
]

DIALOGS = [
    (Scene("setup", [GAME_SETUP], top="Setup"), "Game setup."),
    (setup_list(1000), "The list of games."),
    (setup_list(1007), "The list of speeds."),
    (setup_list(1008), "The list of kinds of advice."),
    (setup_list(1009), "The list of decks."),
    (Scene("table_setup", [TABLE_SETUP], top="Setup Table"), "Table setup."),
    (Scene("table_setup_list", [TABLE_SETUP, "press 1005"], top=""), "The list of card backs."),
    (Scene("table_setup_changed", [TABLE_SETUP, "select 1005 7", "press 1013"], top="Setup Table"),
     "Another card back, and a box ticked."),
    (Scene("color", COLORS, top="Edit RGB Color"), "The colour of the table."),
    (Scene("color_changed", COLORS + ["slide 6000 140", "slide 6001 25", "slide 6002 60"],
           top="Edit RGB Color"), "Another colour."),
    (Scene("high_scores", [HIGH_SCORES], settings=SCORES, top="High Scores"), "The high scores."),
    (Scene("high_scores_entry", ENTRY + ["type Ann"], settings=SCORES, top="High Scores"),
     "A new high score, its name being typed."),
    (Scene("high_scores_marked", ENTRY + ["type Ann", "key Ctrl+A"], settings=SCORES,
           top="High Scores"), "The name marked."),
    (Scene("high_scores_added", ENTRY + ["type Ann", "press 1011"], settings=SCORES,
           top="High Scores"), "The name added."),
    (Scene("message_box", ENTRY + ["press 1"]), "The question before a score goes unnamed."),
    (Scene("about", [ABOUT], top="About Feltside"), "About."),
]

# The album, by its headings.
PAGES = {
    "Title": TITLE,
    "Blackjack": BLACKJACK,
    "Blackjack on plain felt": PLAIN_BLACKJACK,
    "Video poker": POKER,
    "Video poker, plain": PLAIN_POKER_SCENES,
    "The menu": MENU,
    "The dialogs": DIALOGS,
}

# The pictures of the README, by the scenes that they show.
README = {"title": "title", "blackjack": "split_settled", "video_poker": "poker_drawn"}
