"""The page in a real browser, worked as a person works it."""

import functools
import http.server
import json
import subprocess
import threading
import time
from io import BytesIO
from pathlib import Path

from PIL import Image
from selenium import webdriver
from selenium.webdriver import ActionChains
from selenium.webdriver.chrome.service import Service
from selenium.webdriver.common.by import By

ROOT = Path(__file__).resolve().parent.parent.parent
SITE = ROOT / "build" / "web" / "site"
FRAME = (240, 294)
PATIENCE = 15  # seconds; a dealer may draw three cards

# The clock from which the cards come stands still where a test says so.
FIXED_CLOCK = """
const TheirDate = Date;
Date = class extends TheirDate {
  constructor(...given) { if (given.length) super(...given); else super('%s'); }
};"""
# How many timers are running, in window.timers.
TIMERS = """
window.timers = 0;
const set = window.setTimeout, clear = window.clearTimeout, running = new Set();
window.setTimeout = function (call, ...rest) {
  const timer = set(() => { running.delete(timer); timers = running.size; call(); }, ...rest);
  timers = running.add(timer).size;
  return timer;
};
window.clearTimeout = function (timer) {
  clear(timer);
  running.delete(timer);
  timers = running.size;
};
window.setInterval = window.requestAnimationFrame = function () { timers = Infinity; };"""
# The sixth value finds no room.
LITTLE_STORAGE = """
const put = Storage.prototype.setItem;
let stored = 0;
Storage.prototype.setItem = function (name, value) {
  if (++stored === 6) throw new DOMException('full', 'QuotaExceededError');
  put.call(this, name, value);
};"""
NO_STORAGE = """
Object.defineProperty(window, 'localStorage', {
  get() { throw new DOMException('not here', 'SecurityError'); }
});"""


class QuietHandler(http.server.SimpleHTTPRequestHandler):
    def log_message(self, *_):
        pass


class Server:
    """Serves a folder to this machine until it is closed; again at the same address."""

    def __init__(self, folder=SITE, port=0):
        handler = functools.partial(QuietHandler, directory=folder)
        self.server = http.server.ThreadingHTTPServer(("127.0.0.1", port), handler)
        self.port = self.server.server_port
        self.address = f"http://127.0.0.1:{self.port}/"
        threading.Thread(target=self.server.serve_forever, daemon=True).start()

    def close(self):
        self.server.shutdown()
        self.server.server_close()


class Stylus:
    """The desktop's game without a window, to compare with."""

    def __init__(self, folder):
        self.folder = Path(folder)
        self.process = subprocess.Popen(
            [ROOT / "build/check/feltside-stylus"], stdin=subprocess.PIPE, stdout=subprocess.PIPE,
            text=True, env={"XDG_CONFIG_HOME": str(folder)})

    def send(self, line):
        print(line, file=self.process.stdin, flush=True)
        return json.loads(self.process.stdout.readline())

    def shot(self):
        self.send(f"shot {self.folder}/shot.png")
        with Image.open(self.folder / "shot.png") as picture:
            return picture.convert("RGB")

    def middle_of(self, number):
        """Where a control of the topmost dialog stands."""
        control, = (c for c in self.send("state")["controls"] if c["number"] == number)
        left, top, right, bottom = control["rect"]
        return (left + right) // 2, (top + bottom) // 2

    def close(self):
        self.process.communicate()


def open_browser(phone=False):
    options = webdriver.ChromeOptions()
    for word in ("--headless=new", "--no-sandbox", "--disable-gpu", "--force-color-profile=srgb",
                 "--window-size=860,900", "--hide-scrollbars"):
        options.add_argument(word)
    options.set_capability("goog:loggingPrefs", {"browser": "ALL"})
    if phone:
        options.add_experimental_option("mobileEmulation", {"deviceMetrics": {
            "width": 390, "height": 844, "pixelRatio": 3.0, "touch": True, "mobile": True}})
    return webdriver.Chrome(options=options, service=Service("/usr/bin/chromedriver"))


class Page:
    """A tab with the game."""

    def __init__(self, browser, address, *scripts, phone=False):
        self.browser = browser
        self.phone = phone
        self.complaints()  # those about earlier pages
        added = [self.cdp("Page.addScriptToEvaluateOnNewDocument", source=script)["identifier"]
                 for script in scripts]
        browser.get(address)
        for identifier in added:
            self.cdp("Page.removeScriptToEvaluateOnNewDocument", identifier=identifier)

    def cdp(self, command, **values):
        return self.browser.execute_cdp_cmd(command, values)

    def be_of_size(self, width, height, sharpness):
        self.cdp("Emulation.setDeviceMetricsOverride", width=width, height=height,
                 deviceScaleFactor=sharpness, mobile=self.phone)
        # The picture is then drawn at the next whole multiple of its size.
        self.wait_until(lambda: self.run(
            "const shown = document.getElementById('picture');"
            "const across = shown.getBoundingClientRect().width * devicePixelRatio;"
            f"return innerWidth === {width} && devicePixelRatio === {sharpness} &&"
            "  shown.width === Math.ceil(Math.round(across) / 240) * 240"), "the other size")

    def cover_below(self, height):
        """Brings up a keyboard that leaves so much of the page in sight."""
        self.run(f"Object.defineProperty(visualViewport, 'height', {{value: {height}}});"
                 "visualViewport.dispatchEvent(new Event('resize'))")

    def run(self, script):
        return self.browser.execute_script(script)

    def worker(self, what):
        """What there is to say of the worker's registration `r`."""
        return self.run(f"return navigator.serviceWorker.getRegistration().then(r => {what})")

    def wait_until_kept(self):
        """Waits until the whole game is kept for the time without a network."""
        self.run("return navigator.serviceWorker.ready.then(() => 0)")

    def words(self):
        """What was told last to a reader of the screen."""
        return self.run("return document.getElementById('voice').textContent").strip("\u00a0")

    def wait_until(self, true, what):
        end = time.monotonic() + PATIENCE
        while not true():
            if time.monotonic() > end:
                raise AssertionError(f"not within {PATIENCE} s: {what}; last words: {self.words()}")
            time.sleep(0.02)

    def wait_for(self, part):
        """Waits until these words are told; returns all that was told with them."""
        said = []

        def is_told():
            said[:] = [self.words()]
            return part in said[0]
        self.wait_until(is_told, part)
        return said[0]

    def keys(self, *keys):
        ActionChains(self.browser).send_keys(*keys).perform()

    def place(self):
        """The picture's place in the window, in the page's units."""
        rect = self.run("const r = document.getElementById('picture').getBoundingClientRect();"
                        "return [r.left, r.top, r.width, r.height]")
        return rect

    def point(self, at):
        """The place in the window of the middle of a pixel of the picture."""
        left, top, width, height = self.place()
        return left + (at[0] + 0.5) * width / FRAME[0], top + (at[1] + 0.5) * height / FRAME[1]

    def pointer(self, kind, at):
        x, y = self.point(at)
        if self.phone:
            name = {"down": "touchStart", "move": "touchMove", "up": "touchEnd"}[kind]
            points = [] if kind == "up" else [{"x": x, "y": y}]
            self.cdp("Input.dispatchTouchEvent", type=name, touchPoints=points)
        else:
            name = {"down": "mousePressed", "move": "mouseMoved", "up": "mouseReleased"}[kind]
            self.cdp("Input.dispatchMouseEvent", type=name, x=x, y=y, button="left", clickCount=1,
                     buttons=0 if kind == "up" else 1)

    def tap(self, at):
        self.pointer("down", at)
        self.pointer("up", at)

    def drag(self, start, end):
        self.pointer("down", start)
        self.pointer("move", end)
        self.pointer("up", end)

    def screen(self):
        return Image.open(BytesIO(self.browser.get_screenshot_as_png())).convert("RGB")

    def picture(self):
        """The picture as it is seen, with its place in pixels of the display."""
        ratio = self.run("return devicePixelRatio")
        left, top, width, height = (round(side * ratio) for side in self.place())
        return self.screen().crop((left, top, left + width, top + height))

    def kept(self):
        """What the browser keeps for the page, without what stands before every name."""
        items = self.run("return Object.entries(localStorage)")
        return {name.rsplit("/", 1)[1]: value for name, value in items}

    def complaints(self):
        return [line["message"] for line in self.browser.get_log("browser")]

    def ended(self):
        return self.browser.find_element(By.ID, "ended").is_displayed()
