#!/usr/bin/env python3
"""Tries to make the game lose what it keeps:

    tools/break_store.py BUILD_FOLDER [--short] [--kills N] [--seed N]

Plays one session of feltside-stylus, which changes all settings and enters a score, again and
again: each system call by which files are kept fails in turn, and each allocation; games are
killed at random moments, two at a time on one file; the file system is full, read-only and slow.
Prints what came of it. "Lost" is what stood in the file before and is not whole there after;
"silent" is what was not stored without a word to the player, "crashed" a game that did not end by
itself. Ends with 1 where there was any of them.
With --short, some of all.
Before it: cmake --build BUILD_FOLDER --target feltside-stylus failing-calls
"""

import argparse
import errno
import json
import os
import random
import signal
import subprocess
import sys
import tempfile
import time
import tomllib
from collections import Counter
from concurrent.futures import ThreadPoolExecutor
from pathlib import Path

BEFORE = "[Other]\nkeep = 'a thing'\n[Settings]\nHigh0 = 'Ann 500'\nHigh1 = 'Bob 300'\n"
GAME_SETUP = {"STRATTYPE": 2, "GAME_TYPE": 0, "NUMDECKS": 2, "PLAYSPEED": 2}
TABLE_SETUP = {"CARDBACK": 60, "TABLECOLOR": 39680, "BOXCOLOR": 6599815, "VIDEODISCARDS": 5,
               "FANCYVP": 1, "FANCYBJ": 1, "USEHIGH": 1}
SCORE = "Zoe 250"
OK = ["press 1"] * 3  # also of the boxes that tell of trouble
LINES = [*OK, "command deal", "command stand", "key N",
         "command game-setup", "select 1008 2", "select 1009 2", "select 1007 2", *OK,
         "command table-setup", "select 1005 6", "press 1013", *OK,
         "wallet 250", "command exit", "type Zoe", *OK, "command exit", *OK]
ERRORS = [errno.EIO, errno.ENOSPC, errno.EINTR, errno.EACCES]
FAULTS = ("lost", "silent", "crashed")
PRELOADING = {"ASAN_OPTIONS": "verify_asan_link_order=0:alloc_dealloc_mismatch=0"}
MOUNTED = """
mount -t tmpfs -o size=16k none "$1" && mkdir "$1/Quillworks" && cp "$2" "$1/Quillworks" &&
{ %s; } && { "$3"; code=$?; rm "$2"; cp "$1/Quillworks/Feltside.toml" "$2"; exit $code; }"""
FULL = 'cat /dev/zero >"$1/filler" 2>/dev/null || true'
READ_ONLY = 'mount -o remount,ro "$1"'


class Store:
    """A folder with a settings' file, for as long as it is in use."""

    def __init__(self):
        self.folder = tempfile.TemporaryDirectory(prefix="feltside-store-")
        self.file = Path(self.folder.name, "Quillworks", "Feltside.toml")
        self.file.parent.mkdir()
        self.file.write_text(BEFORE)

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self.folder.cleanup()

    def settings(self):
        """What the file holds; nothing where something is lost."""
        try:
            document = tomllib.loads(self.file.read_text())
        except (OSError, ValueError):
            return None
        settings = document.get("Settings", {})
        scores = [settings.get(f"High{place}") for place in range(5)]
        steps = [sum(name in settings for name in step) for step in (GAME_SETUP, TABLE_SETUP)]
        whole = (document.get("Other") == {"keep": "a thing"}
                 and {"Ann 500", "Bob 300"} < {*scores}
                 and steps[0] in (0, len(GAME_SETUP)) and steps[1] in (0, len(TABLE_SETUP)))
        return settings if whole else None


def is_complete(settings):
    return {*GAME_SETUP.items(), *TABLE_SETUP.items()} < {*settings.items()} and \
        SCORE in settings.values()


def was_told(answers):
    """Whether a box has named the settings' file."""
    return any("The settings' file" in control["text"]
               for line in answers.splitlines() for control in json.loads(line).get("controls", []))


class Breaker:
    def __init__(self, build):
        self.game = build / "feltside-stylus"
        self.preloaded = build / "fuzz" / "libfailing-calls.so"
        self.outcomes = {}

    def environment(self, folder, faults):
        failing = {"LD_PRELOAD": str(self.preloaded), **PRELOADING} if faults else {}
        return {**os.environ, "XDG_CONFIG_HOME": str(folder), **failing, **faults}

    def note(self, what, outcome, how=""):
        self.outcomes.setdefault(what, Counter())[outcome] += 1
        if outcome in FAULTS:
            print(f"{what}: {outcome} {how}", flush=True)

    def judge(self, what, store, done, how):
        """Of a session that has come to its end, by itself or not."""
        settings = store.settings()
        if settings is None:
            outcome = "lost"
        elif is_complete(settings):
            outcome = "stored"
        elif done.returncode > 0 or "std::bad_alloc" in done.stderr:
            outcome = "ended"
        elif done.returncode < 0:
            outcome = "crashed"
        else:
            outcome = "told" if was_told(done.stdout) else "silent"
        self.note(what, outcome, how)

    def play(self, what, faults):
        with Store() as store:
            done = subprocess.run([self.game], input="\n".join(LINES), capture_output=True,
                                  text=True, check=False,
                                  env=self.environment(store.folder.name, faults))
            self.judge(what, store, done, faults)

    def counts(self):
        """How many calls and allocations a session has."""
        with tempfile.NamedTemporaryFile("r") as counts:
            self.play("nothing", {"COUNTS_FILE": counts.name})
            return [int(number) for number in counts.read().split()]

    def fail_calls(self, every):
        calls, allocations = self.counts()
        tries = [("a system call fails", {"FAIL_CALL": str(number), "FAIL_ERROR": str(error)})
                 for number in range(1, calls + 1, every)
                 for error in (ERRORS if every == 1 else [ERRORS[number % len(ERRORS)]])]
        tries += [("an allocation fails", {"FAIL_MEMORY": str(number)})
                  for number in range(1, allocations + 1, every * every * every)]
        with ThreadPoolExecutor(os.cpu_count()) as pool:
            for _ in pool.map(lambda one: self.play(*one), tries):
                pass  # what a try raised is raised here

    def slow(self, microseconds):
        self.play("a slow file system", {"CALL_DELAY": str(microseconds)})

    def mounted(self, what, preparation):
        """On a file system of its own, which takes a kernel that lets users have one."""
        trial = subprocess.run(["unshare", "-rm", "mount", "-t", "tmpfs", "none", "/mnt"],
                               capture_output=True, text=True, check=False)
        if trial.returncode:
            print(f"{what}: cannot be tried here: {trial.stderr.strip()}")
            return
        with Store() as store, tempfile.TemporaryDirectory() as place:
            script = MOUNTED % preparation
            done = subprocess.run(["unshare", "-rm", "sh", "-c", script, "sh", place, store.file,
                                   self.game], input="\n".join(LINES), capture_output=True,
                                  text=True, env=self.environment(place, {}), check=False)
            self.judge(what, store, done, done.stderr)

    def start(self, store, steps):
        """A game that changes one setting after another, at its first answer."""
        game = subprocess.Popen([self.game], stdin=subprocess.PIPE, stdout=subprocess.PIPE,
                                stderr=subprocess.DEVNULL, text=True, bufsize=1 << 20,
                                env=self.environment(store.folder.name, {}))
        for step in steps:
            game.stdin.write("\n".join(step) + "\n")
        game.stdin.flush()
        game.first_answer = game.stdout.readline()
        return game

    def kill_two(self, chance):
        decks = [number % 3 for number in range(200)]
        backs = [number % 12 for number in range(200)]
        # A confirmed game setup deals a hand, which must be over before the next.
        game_steps = [["command game-setup", f"select 1009 {item}", "press 1", "key N",
                       "command stand"] for item in decks]
        table_steps = [["command table-setup", f"select 1005 {item}", "press 1"] for item in backs]
        with Store() as store:
            games = [self.start(store, game_steps), self.start(store, table_steps)]
            for game in chance.sample(games, 2):
                time.sleep(chance.uniform(0, 0.05))
                game.send_signal(signal.SIGKILL)
            answers = [game.first_answer + game.communicate()[0] for game in games]
            settings = store.settings()
            self.judge_killed(settings, "NUMDECKS", decks, answers[0], len(game_steps[0]))
            self.judge_killed(settings, "CARDBACK", [54 + item for item in backs], answers[1],
                              len(table_steps[0]))

    def judge_killed(self, settings, name, values, answers, step_length):
        """The last value that was answered for is kept, or the one after it."""
        answered = len(answers.splitlines())
        steps = answered // step_length + (answered % step_length >= 3)
        expected = [*values[max(steps - 1, 0):steps + 1], *([None] if steps == 0 else [])]
        kept = settings is not None and settings.get(name) in expected
        self.note("killed, one of two", "stored" if kept else "lost",
                  f"{name} = {settings and settings.get(name)} after {steps} steps")

    def report(self):
        columns = ("stored", "told", "ended", *FAULTS)
        print(f"{'':24}{'tried':>8}" + "".join(f"{column:>8}" for column in columns))
        for what, outcomes in self.outcomes.items():
            print(f"{what:24}{outcomes.total():8}" +
                  "".join(f"{outcomes[column]:8}" for column in columns))
        return any(outcomes[fault] for outcomes in self.outcomes.values() for fault in FAULTS)


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("build", type=lambda text: Path(text).resolve())
    parser.add_argument("--short", action="store_true")
    parser.add_argument("--seed", type=int, default=1)
    parser.add_argument("--kills", type=int, default=10000)
    arguments = parser.parse_args()
    breaker = Breaker(arguments.build)
    breaker.fail_calls(every=7 if arguments.short else 1)
    chance = random.Random(arguments.seed)
    for _ in range((20 if arguments.short else arguments.kills) // 2):
        breaker.kill_two(chance)
    breaker.mounted("a full file system", FULL)
    breaker.mounted("a read-only file system", READ_ONLY)
    breaker.slow(microseconds=1000 if arguments.short else 20000)
    return breaker.report()


if __name__ == "__main__":
    sys.exit(main())
