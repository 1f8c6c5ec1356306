"""Firefox, worked over its own remote protocol: Debian has no driver for it."""

import json
import socket
import subprocess
import tempfile
import time

PORT = 2828
ENTER = "\ue007"


class Firefox:
    def __init__(self):
        self.profile = tempfile.TemporaryDirectory()
        self.process = subprocess.Popen(
            ["firefox-esr", "--headless", "--no-remote", "--marionette", "--profile",
             self.profile.name],
            stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
        self.socket = self.connect()
        self.number = 0
        self.receive()  # its greeting
        self.send("WebDriver:NewSession")

    def connect(self):
        for _ in range(300):
            try:
                return socket.create_connection(("127.0.0.1", PORT))
            except OSError:
                time.sleep(0.1)
        raise AssertionError("Firefox does not come up")

    def receive(self):
        """A message is its length, a colon, and so much JSON."""
        length = b""
        while not length.endswith(b":"):
            length += self.socket.recv(1)
        text = b""
        while len(text) < int(length[:-1]):
            text += self.socket.recv(int(length[:-1]) - len(text))
        return json.loads(text)

    def send(self, command, **values):
        self.number += 1
        message = json.dumps([0, self.number, command, values])
        self.socket.sendall(f"{len(message)}:{message}".encode())
        _, _, error, result = self.receive()
        if error:
            raise AssertionError(error)
        return result

    def words(self):
        script = "return document.getElementById('voice').textContent"
        return self.send("WebDriver:ExecuteScript", script=script, args=[])["value"]

    def wait_for(self, part):
        for _ in range(1000):
            if part in self.words():
                return self.words()
            time.sleep(0.03)
        raise AssertionError(f"not told: {part}; but: {self.words()}")

    def key(self, key):
        actions = [{"type": kind, "value": key} for kind in ("keyDown", "keyUp")]
        self.send("WebDriver:PerformActions",
                  actions=[{"type": "key", "id": "keyboard", "actions": actions}])

    def close(self):
        self.process.terminate()
        self.process.wait()
        self.socket.close()
        self.profile.cleanup()


def play_a_hand(address):
    """Deals, and stands where that is to be asked; returns how it ends."""
    firefox = Firefox()
    try:
        firefox.send("WebDriver:Navigate", url=address)
        firefox.wait_for("Enter to deal")
        firefox.key(ENTER)
        words = firefox.wait_for("You have")
        if "Insurance?" in words:
            firefox.key("n")
            words = firefox.wait_for("to")
        if "S to stand" in words:
            firefox.key("s")
        return firefox.wait_for("Enter to deal")
    finally:
        firefox.close()
