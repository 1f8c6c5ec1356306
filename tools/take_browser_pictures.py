#!/usr/bin/env python3
"""Takes the album's pictures of the page, to be looked at: tools/take_browser_pictures.py"""

import sys
from pathlib import Path

# The page is worked as its tests work it.
sys.path.insert(0, str(Path(__file__).resolve().parent.parent / "tests" / "web"))
from page import FIXED_CLOCK, ROOT, Page, Server, open_browser  # noqa: E402
from web_test import DEAL, EXIT, MENU, NATURAL, PLAIN, STAND  # noqa: E402

FOLDER = ROOT / "docs" / "album" / "browser"


def save(page, name):
    FOLDER.mkdir(parents=True, exist_ok=True)
    page.screen().quantize(256).save(FOLDER / f"{name}.png", optimize=True)


def open_page(browser, address, time, phone):
    page = Page(browser, address, FIXED_CLOCK % time, phone=phone)
    page.wait_for("Enter to deal")
    page.run("localStorage.clear()")
    return page


def take_desktop(address):
    browser = open_browser()
    page = open_page(browser, address, PLAIN, False)
    page.be_of_size(900, 640, 1)
    page.tap(DEAL)
    page.wait_for("You have")
    save(page, "desktop")
    browser.quit()


def take_phone(address):
    browser = open_browser(phone=True)
    page = open_page(browser, address, PLAIN, True)
    page.tap(DEAL)
    page.wait_for("You have")
    page.be_of_size(390, 844, 3)
    page.tap(STAND)
    page.wait_for("Enter to deal")
    save(page, "phone")
    page.be_of_size(844, 390, 3)
    save(page, "phone_lying")

    page = open_page(browser, address, NATURAL, True)
    page.be_of_size(390, 844, 3)
    page.tap(DEAL)
    page.wait_for("Blackjack!")
    page.tap(MENU)
    page.tap(EXIT)
    page.wait_for("Enter Name")
    page.keys("Ann")
    page.cover_below(480)
    page.wait_until(lambda: page.place()[1] + page.place()[3] <= 480, "room for the keyboard")
    save(page, "phone_typing")
    for key in ("\ue007", "\ue007"):
        page.keys(key)
    page.wait_until(page.ended, "the end")
    save(page, "ended")
    browser.quit()


def main():
    server = Server()
    take_desktop(server.address)
    take_phone(server.address)
    server.close()


if __name__ == "__main__":
    main()
