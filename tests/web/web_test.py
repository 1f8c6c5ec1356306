"""Plays the page in Chromium, as a desktop and as a phone, and a hand in Firefox."""

import hashlib
import re
import shutil
import tempfile
import unittest
from pathlib import Path

from firefox import play_a_hand
from page import (FIXED_CLOCK, LITTLE_STORAGE, NO_STORAGE, SITE, TIMERS, Page, Server, Stylus,
                  open_browser)
from PIL import Image
from selenium.webdriver.common.keys import Keys

NATURAL = "2000-01-01T12:00:04"  # a time at which the first deal is a natural
PLAIN = "2000-01-01T12:00:09"  # and one that is to be played
MENU = (30, 12)
GAME_SETUP, TABLE_SETUP, HIGH_SCORES, HELP, EXIT = (
    (40, y) for y in (36, 55, 74, 131, 150))
DEAL = (188, 12)
STAND = (101, 12)
PLAY = (112, 222)
CARDS = {name: number for number, name in enumerate(
    [f"{rank} of {suit}" for suit in ("clubs", "diamonds", "hearts", "spades")
     for rank in ("ace", "two", "three", "four", "five", "six", "seven", "eight", "nine", "ten",
                  "jack", "queen", "king")], 1)}


class WebTest(unittest.TestCase):
    phone = False

    @classmethod
    def setUpClass(cls):
        cls.browser = open_browser(cls.phone)

    @classmethod
    def tearDownClass(cls):
        cls.browser.quit()

    def setUp(self):
        self.server = Server()
        self.addCleanup(lambda: self.server.close())
        self.folder = tempfile.TemporaryDirectory()
        self.addCleanup(self.folder.cleanup)
        self.desk = Stylus(self.folder.name)
        self.addCleanup(self.desk.close)

    def open(self, *scripts, told="Enter to deal"):
        page = Page(self.browser, self.server.address, *scripts, phone=self.phone)
        page.wait_for(told)
        return page

    def enter_a_score(self, page, type_name):
        """Wins by a natural and leaves."""
        page.tap(DEAL)
        page.wait_for("Blackjack!")
        page.tap(MENU)
        page.tap(EXIT)
        page.wait_for("Enter Name: text, empty")
        type_name()
        self.desk.send("wallet 107.5")
        self.desk.send("command exit")
        page.tap(self.desk.middle_of(1011))
        page.wait_for("107")


class Game:
    """What is played on every device."""

    def assert_shows(self, page, picture):
        """The page shows this to the pixel, at a whole multiple."""
        seen = page.picture()
        multiple = seen.width // picture.width
        self.assertEqual(seen.size, (picture.width * multiple, picture.height * multiple))
        larger = picture.resize(seen.size, Image.Resampling.NEAREST)
        self.assertEqual(seen.tobytes(), larger.tobytes())

    def deal_plain(self, page):
        page.tap(DEAL)
        return page.wait_for("H to hit")

    def test_shows_and_tells_what_the_desktop_does(self):
        page = self.open(FIXED_CLOCK % PLAIN, TIMERS)
        page.be_of_size(*self.whole, self.sharpness)
        page.wait_until(lambda: page.place()[2] * self.sharpness % 240 == 0, "a whole multiple")
        self.assert_shows(page, self.desk.shot())
        words = self.deal_plain(page)
        player, other, dealer = (CARDS[name] for name in re.findall(r"the (\w+ of \w+)", words))
        self.desk.send(f"stack {player} {other} {CARDS['two of clubs']} {dealer}")
        self.desk.send("command deal")
        self.assertEqual(self.desk.send("words")["words"], words)
        self.assert_shows(page, self.desk.shot())
        page.wait_until(lambda: page.run("return timers") == 0, "the last timer's end")
        self.assertEqual(page.run("return HEAP8.length"), 2 * 2**20)
        self.assertEqual(page.complaints(), [])

    def test_keeps_settings_and_plays_the_other_game(self):
        page = self.open()
        page.tap(MENU)
        page.tap(GAME_SETUP)
        self.desk.send("command game-setup")
        page.wait_for("Game Type")
        page.tap(self.desk.middle_of(1000))
        left, below = self.desk.middle_of(1000)
        page.tap((left, below + 33))
        page.tap(self.desk.middle_of(1))
        self.assertIn("Wallet $99", page.wait_for("You hold all"))
        self.assertEqual(page.kept()["GAME_TYPE"], "1")
        page.tap((54, 130))
        page.wait_for("go")
        page.tap(PLAY)
        page.wait_for("Enter to deal")

        page.tap(MENU)
        page.tap(TABLE_SETUP)
        for line in ("press 2", "command table-setup"):
            self.desk.send(line)
        page.tap(self.desk.middle_of(1500))
        self.desk.send("press 1500")
        page.wait_for("Red: slider")
        top = self.desk.middle_of(6000)
        page.drag((top[0], 130), (top[0], 210))
        page.tap(self.desk.middle_of(1))
        self.desk.send("press 2")
        page.tap(self.desk.middle_of(1))
        page.wait_for("Enter to deal")
        self.assertEqual(int(page.kept()["TABLECOLOR"]) & 0xFF, 255)
        self.assertEqual(page.run("return HEAP8.length"), 2 * 2**20)

        page = self.open()
        page.wait_for("video poker")
        page.run("localStorage.clear()")

    def test_types_a_name_and_ends(self):
        page = self.open(FIXED_CLOCK % NATURAL)
        self.enter_a_score(page, lambda: self.type_name(page))
        self.assertEqual(page.kept()["High0"], '"Zoë Ж 107')
        page.tap(self.desk.middle_of(1))
        page.wait_until(page.ended, "the end")
        page.browser.find_element("id", "again").click()
        page.wait_for("Wallet $100")
        page.tap(MENU)
        page.tap(HIGH_SCORES)
        page.wait_for("Zoë Ж 107")
        page.run("localStorage.clear()")

    def test_tells_that_it_broke_down(self):
        page = self.open()
        page.run("setTimeout(abort)")
        page.wait_until(page.ended, "the end")
        self.assertIn("broke down", page.browser.find_element("id", "ended").text)
        page.browser.find_element("id", "again").click()
        page.wait_for("Wallet $100")

    def test_opens_the_help_and_goes_on_without_a_network(self):
        page = self.open()
        page.wait_until_kept()
        self.server.close()
        page = self.open(FIXED_CLOCK % PLAIN)
        page.tap(MENU)
        page.tap(HELP)
        page.wait_until(lambda: len(self.browser.window_handles) == 2, "the help")
        game, pages = self.browser.window_handles
        self.browser.switch_to.window(pages)
        self.assertIn("feltside.htm#Main_Contents", self.browser.current_url)
        self.assertTrue(page.run("return document.images.length > 5 && "
                                 "[...document.images].every(image => image.naturalWidth > 0)"))
        self.browser.close()
        self.browser.switch_to.window(game)
        self.deal_plain(page)
        self.server = Server(port=self.server.port)


class OnDesktop(Game, WebTest):
    whole = (640, 600)
    sharpness = 1

    def type_name(self, page):
        page.keys("Zoee", Keys.BACKSPACE, Keys.BACKSPACE, "ë Ж")


class OnPhone(Game, WebTest):
    phone = True
    whole = (400, 844)
    sharpness = 3

    def type_name(self, page):
        """As a phone's keyboard: it covers the page, composes letters and corrects a word."""
        self.assertTrue(page.run("return document.activeElement.id === 'field'"))
        page.cover_below(480)
        page.wait_until(lambda: page.place()[1] + page.place()[3] <= 480, "room for the keyboard")
        for text in ("Z", "Zo", "Zoe"):
            page.cdp("Input.imeSetComposition", text=text, selectionStart=len(text),
                     selectionEnd=len(text))
        page.cdp("Input.insertText", text="Zoë Ж")

    def test_stays_in_sight_and_in_play_whatever_the_room(self):
        page = self.open(FIXED_CLOCK % PLAIN)
        before = self.deal_plain(page)
        for width, height in ((844, 390), (390, 400), (390, 844)):
            page.be_of_size(width, height, self.sharpness)

            def fills_it():
                left, top, across, down = page.place()
                return (min(left, top) >= 0 and left + across <= width and top + down <= height
                        and max(across / width, down / height) > 0.85)
            page.wait_until(fills_it, f"all of the picture in {width} x {height}")
        self.assertEqual(page.words(), before)
        page.tap(STAND)
        page.wait_for("Enter to deal")


class Store(WebTest):
    """What the browser keeps, and what it does not; a new version."""

    def test_plays_on_where_nothing_is_kept_and_says_so_once(self):
        page = self.open(NO_STORAGE, told="keeps nothing")
        page.keys(Keys.ENTER)
        page.wait_for("Enter to deal")
        page.tap(MENU)
        page.tap(GAME_SETUP)
        page.wait_for("Game Type")
        page.keys(Keys.DOWN, Keys.ENTER)
        self.assertNotIn("keeps", page.wait_for("You hold all"))

    def test_keeps_all_of_a_dialog_or_nothing(self):
        self.desk.send("command table-setup")
        kept = []
        for scripts, told in (((), "Enter to deal"), ((LITTLE_STORAGE,), "has no room left")):
            page = self.open(*scripts)
            page.tap(MENU)
            page.tap(TABLE_SETUP)
            page.wait_for("Setup Table")
            for number in (1012, 1014, 1010, 1013, 1):
                page.tap(self.desk.middle_of(number))
            page.wait_for(told)
            kept.append(page.kept())
        self.assertEqual(kept[0]["USEHIGH"], "0")
        self.assertEqual(kept[1], kept[0])

    def test_keeps_the_scores_of_two_games(self):
        first = self.open(FIXED_CLOCK % NATURAL)
        handle = self.browser.current_window_handle
        self.browser.switch_to.new_window("tab")
        second = self.open(FIXED_CLOCK % NATURAL)
        self.enter_a_score(second, lambda: second.keys("Second"))
        self.browser.close()
        self.browser.switch_to.window(handle)
        self.enter_a_score(first, lambda: first.keys("First"))
        kept = first.kept()
        self.assertEqual({kept["High0"], kept["High1"]}, {'"First 107', '"Second 107'})
        first.run("localStorage.clear()")

    def test_changes_versions_once_all_tabs_are_closed(self):
        site = Path(self.folder.name) / "site"
        shutil.copytree(SITE, site)
        self.server.close()
        self.server = Server(site)
        page = self.open()
        page.wait_until_kept()

        def shown():
            return page.run("return document.querySelector('script[src]').src").split("?")[1]
        version = shown()

        def digest():
            return hashlib.sha256((site / "index.html").read_bytes()).hexdigest()
        old = digest()
        for name in ("index.html", "worker.js"):
            file = site / name
            file.write_text(file.read_text().replace(version, "newer0000000"))
        page = self.open()
        # The new worker still names the old page: half of a version is not kept.
        page.worker("r.update().then(() => 0)")
        page.wait_until(lambda: page.worker("r.installing === null"), "the end of the half version")
        self.assertTrue(page.worker("r.waiting === null"))
        worker = site / "worker.js"
        worker.write_text(worker.read_text().replace(old, digest()))
        page.worker("r.update().then(() => 0)")
        page.wait_until(lambda: page.worker("r.waiting !== null"), "the newer version")
        page = self.open()
        self.assertEqual(shown(), version)
        self.assertTrue(page.worker("r.waiting !== null"))

        def has_changed():
            self.open()
            if shown() != version:
                return True
            self.browser.get("about:blank")  # the browser needs a moment without the game
            return False
        self.browser.get("about:blank")
        page.wait_until(has_changed, "the change")
        self.assertEqual(shown(), "newer0000000")


class InFirefox(unittest.TestCase):
    def test_plays_a_hand(self):
        server = Server()
        self.addCleanup(server.close)
        self.assertIn("Enter to deal", play_a_hand(server.address))


if __name__ == "__main__":
    unittest.main()
