"""All pictures other than cards."""

import blackjack_table
import buttons
import icons
import poker_table
import title


def make_all(output_dir):
    for part in (buttons, icons, blackjack_table, poker_table, title):
        part.make_all(output_dir)
