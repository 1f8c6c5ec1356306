#!/usr/bin/env python3
"""Checks who includes whom: tools/check_includes.py

Holds the folders apart (the game's rules know no window, the layer knows no game) and keeps the
libraries behind the layer. Names each line that crosses a border; exits with 1 if there is one.
"""

import re
import sys
from pathlib import Path

ROOT = Path(__file__).resolve().parent.parent

DRAW, HOST, STORE, WINDOW, DIALOG = (
    f"platform/{room}/" for room in ("draw", "host", "store", "window", "dialog"))
PLATFORM = (DRAW, HOST, STORE, WINDOW, DIALOG)
GAME = ("engine/", "render/", "table/", "shell/")
LAYOUT = ("render/table_layout.h", "render/picture_ids.h", "render/money_text.h")

# What of ours a file may include, by beginnings. The first line whose beginning fits the file holds
# for it; a file that none fits lies where nothing of ours belongs.
OURS = [
    (DRAW, (DRAW,)),
    (HOST, (DRAW, HOST)),
    (STORE, (HOST, STORE)),
    (WINDOW, (DRAW, HOST, STORE, WINDOW)),
    (DIALOG, PLATFORM),
    ("engine/", ("engine/", f"{HOST}runtime.h", f"{DIALOG}message_box.h")),
    *((f"render/{file}", LAYOUT + ("engine/", DRAW))
      for file in ("table_layout", "targets", "drawing_toolkit", "money_text", "blackjack_drawing",
                   "video_poker_drawing")),
    ("render/picture_ids", (DRAW,)),
    ("render/", ("engine/", "render/", "table/feltside_view.h") + PLATFORM),
    ("table/", ("engine/", "render/", "table/") + PLATFORM),
    ("shell/", GAME + PLATFORM),
    ("stylus/", GAME + PLATFORM + ("stylus/",)),
    ("tests/", GAME + PLATFORM + ("stylus/", "tests/")),
    ("bench/", GAME + PLATFORM + ("stylus/", "bench/")),
    ("fuzz/", GAME + PLATFORM + ("stylus/", "fuzz/", "tests/")),
]

SDL = r"SDL.*"
SYSTEM = r"(sys/\w+|fcntl|unistd|pwd|signal|poll|errno|dirent)\.h"
WINDOWS = r"(windows|shellapi|shlobj|fcntl|io|process|share|sys/stat|unistd)\.h"
GTEST = r"g(test|mock)/g(test|mock).*\.h"
JSON = r"nlohmann/.*"

# The same for the headers of libraries.
LIBRARIES = [
    (r"platform/draw/\w+\.cpp", r"png\.h|freetype/.*|utf8cpp/.*"),
    (r"platform/host/sdl_\w+\.h", SDL),
    (r"platform/host/\w+\.cpp", f"{SDL}|malloc\\.h|{SYSTEM}"),
    (r"platform/store/\w+\.cpp", rf"toml\+\+/.*|{SYSTEM}"),
    (r"(platform/\w+|tests/\w+)/windows_\w+\.cpp", WINDOWS),
    (r"stylus/.*", JSON),
    (r"tests/platform/(posix_)?sdl_\w+\.cpp", SDL),
    (r"tests/platform/posix_sdl_\w+\.cpp", r"dlfcn\.h"),
    (r"tests/.*", f"{GTEST}|{JSON}|{SYSTEM}"),
    (r"bench/.*", f"{SDL}|{SYSTEM}|dlfcn\\.h|benchmark/benchmark\\.h"),
    (r"fuzz/profile\.cpp", r"toml\+\+/.*"),
    (r"fuzz/.*", f"{JSON}|{SYSTEM}|dlfcn\\.h"),
]

INCLUDE = re.compile(r'^\s*#\s*include\s*([<"])([^>"]+)[>"]')
LIBRARY_NAME = re.compile(r"\b(?:SDL|FT|png)_\w+|\b(?:toml|utf8)::\w+")


def source_files():
    """All headers and sources of ours, as paths from the root."""
    found = (path.relative_to(ROOT).as_posix()
             for ending in ("h", "cpp") for path in ROOT.rglob(f"*.{ending}")
             if not any((folder / "CMakeCache.txt").exists() for folder in path.parents))
    return sorted(path for path in found if not path.startswith("build/"))


def includes_of(text):
    """(line number, own, path) of every include; own: written with quotes."""
    for number, line in enumerate(text.splitlines(), 1):
        if match := INCLUDE.match(line):
            yield number, match[1] == '"', match[2]


def allowed_to(path):
    """What of ours a file may include; None where no rule names its folder."""
    return next((allowed for beginning, allowed in OURS if path.startswith(beginning)), None)


def may_include_ours(path, included):
    return included.startswith(allowed_to(path) or ())


def is_standard(included):
    """The headers of the standard library have neither a dot nor a slash."""
    return re.fullmatch(r"\w+", included) is not None


def may_include_library(path, included):
    return is_standard(included) or any(
        re.fullmatch(files, path) and re.fullmatch(allowed, included)
        for files, allowed in LIBRARIES)


def without_comments(text):
    return re.sub(r"//[^\n]*|/\*.*?\*/", "", text, flags=re.DOTALL)


class Checker:
    def __init__(self):
        self.texts = {path: (ROOT / path).read_text(encoding="utf-8") for path in source_files()}
        self.faults = []

    def fault(self, path, number, what):
        self.faults.append(f"{path}:{number}: {what}")

    def check_includes(self, path, text):
        for number, own, included in includes_of(text):
            if not own:
                if not may_include_library(path, included):
                    self.fault(path, number, f"may not include the library's <{included}>")
            elif included not in self.texts:
                self.fault(path, number, f'no file "{included}" from the root')
            elif not may_include_ours(path, included):
                self.fault(path, number, f'may not include "{included}"')

    def check_names(self, path, text):
        """Even by name the libraries are known to the layer alone, and to what the game is measured
        against."""
        if re.fullmatch(r"platform/\w+/(\w+\.cpp|sdl_\w+\.h)|bench/\w+\.(cpp|h)|"
                        r"(tests/platform/(posix_)?sdl_\w+|fuzz/profile)\.cpp", path):
            return
        for number, line in enumerate(without_comments(text).splitlines(), 1):
            if match := LIBRARY_NAME.search(line):
                self.fault(path, number, f"may not use {match[0]}")

    def check_usings(self, path, text):
        """No file takes up a name that it has no use for. (clang-tidy sees the files of a folder as
        one.)"""
        for match in re.finditer(r"^using (?:\w+::)+(\w+);$", text, re.MULTILINE):
            if len(re.findall(rf"\b{match[1]}\b", without_comments(text))) == 1:
                number = 1 + text.count("\n", 0, match.start())
                self.fault(path, number, f"has no use for {match[1]}")

    def check_game(self, path, text):
        """The layer knows no game, not even by name."""
        if path.startswith(PLATFORM) and (match := re.search("feltside", text, re.IGNORECASE)):
            self.fault(path, 1 + text.count("\n", 0, match.start()), "names the game")

    def reached_from(self, path, seen):
        """All of our headers that a file includes, through others too."""
        for _, own, included in includes_of(self.texts[path]):
            if own and included in self.texts and included not in seen:
                seen.add(included)
                self.reached_from(included, seen)
        return seen

    def check_reach(self, path):
        """No library comes to the game through a header of the layer."""
        if path.startswith("platform/"):
            return
        for header in sorted(self.reached_from(path, set())):
            for _, own, included in includes_of(self.texts[header]):
                if header.startswith("platform/") and not own and not is_standard(included):
                    self.fault(path, 1, f"is brought <{included}> by {header}")

    def run(self):
        for path, text in self.texts.items():
            if allowed_to(path) is None:
                self.fault(path, 1, "lies in a folder that no rule names")
            self.check_includes(path, text)
            self.check_names(path, text)
            self.check_usings(path, text)
            self.check_game(path, text)
            self.check_reach(path)
            if path.endswith(".h") and not re.search(r"^#pragma once$", text, re.MULTILINE):
                self.fault(path, 1, "has no #pragma once")
        return self.faults


def main():
    checker = Checker()
    faults = checker.run()
    for fault in faults:
        print(fault)
    print(f"{len(checker.texts)} files, {len(faults)} of their lines cross a border")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
