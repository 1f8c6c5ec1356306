#!/usr/bin/env python3
"""Puts faults into the game, one at a time, and sees whether the tests notice:

    tools/mutate.py [--count N] [--seed N] [FOLDER...]

Each fault changes one line of a source of these folders (all of the game and its layer), at random
by the seed. It is built and tested in a copy below build/mutants/, without sanitizers. Prints what
survives, and at last the score of each folder. A survivor is either a test that is missing or a
fault that nobody can see: that is for a person to say.
"""

import argparse
import os
import random
import re
import resource
import shutil
import subprocess
import sys
from collections import Counter
from pathlib import Path

ROOT = Path(__file__).resolve().parent.parent
PLACE = ROOT / "build" / "mutants"
OTHER_EDITIONS = ("web_", "windows_")
FOLDERS = ["engine", "render", "table", "shell", "stylus", "platform"]
CONFIGURE = ["cmake", "-G", "Ninja", "-S", "source", "-B", "build", "-DCMAKE_BUILD_TYPE=Debug",
             "-DCMAKE_CXX_FLAGS_DEBUG=-O1", "-DBUILD_SHARED_LIBS=ON", "-DFELTSIDE_TESTS=ON"]
# The short tests first: most faults are found in a few seconds.
TESTS = ["engine|shell|render|platform", "^play$|fuzz|store", "play-random-0"]
TEST_SECONDS = 240
MOST_MEMORY = 4 << 30  # bytes; some faults make an endless loop of something that grows

SWAPS = [("==", "!="), ("<=", "<"), (">=", ">"), ("&&", "||"), ("||", "&&"), ("true", "false"),
         ("false", "true"), (" < ", " <= "), (" > ", " >= "), (" + ", " - "), (" - ", " + "),
         (" += ", " -= "), (" -= ", " += "), ("++", "--"), ("std::min", "std::max"),
         ("std::max", "std::min"), (".left", ".right"), (".top", ".bottom"), ("width", "height"),
         (".x", ".y"), ("return !", "return "), ("if (", "if (!("), ("begin()", "rbegin()")]
STATEMENT = re.compile(r"^\s+(?!return|break|continue|case|using|const |auto |static )"
                       r"[\w:.\->()*\[\]]+(\(.*\)| [+\-|&]?= .*|\+\+|--);$")
NUMBER = re.compile(r"(?<![\w.])\d+(?![\w.'])")


def faults_of(line):
    """All that one change can make of a line of code."""
    code = line.split("//")[0].rstrip()
    if not code.strip() or code.lstrip().startswith(("#", "*", "namespace", "using")):
        return []
    faults = []
    quoted = [match.span() for match in re.finditer(r'"(\\.|[^"])*"', code)]

    def put(start, end, text):
        if not any(first < end and start < last for first, last in quoted):
            faults.append(code[:start] + text + code[end:])
    for old, new in SWAPS:
        for match in re.finditer(re.escape(old), code):
            if new == "if (!(":  # to the end of the condition
                end = code.rfind(") ") if ") " in code else -1
                if end > 0:
                    faults.append(code[:match.start()] + new + code[match.end():end] + ")" +
                                  code[end:])
            else:
                put(*match.span(), new)
    for match in NUMBER.finditer(code):
        put(*match.span(), str(int(match[0]) + 1))
    if STATEMENT.match(code):
        faults.append("")
    return faults


def all_faults(folders):
    """(file, line number, new line), in a steady order."""
    for folder in folders:
        for path in sorted((ROOT / folder).rglob("*.cpp")):
            if path.name.startswith(OTHER_EDITIONS):
                continue
            for number, line in enumerate(path.read_text(encoding="utf-8").splitlines()):
                for fault in faults_of(line):
                    yield path.relative_to(ROOT), number, fault


def run(*command, seconds=None):
    """Whether a command ended well, in time."""
    def limit_memory():
        resource.setrlimit(resource.RLIMIT_AS, (MOST_MEMORY, MOST_MEMORY))
    # No fault is to be caught by luck.
    environment = {**os.environ, "FELTSIDE_SEED": "3"}
    try:
        return subprocess.run(command, cwd=PLACE, env=environment, timeout=seconds,
                              stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
                              preexec_fn=limit_memory, check=False).returncode == 0
    except subprocess.TimeoutExpired:
        return False


def build():
    return run("cmake", "--build", "build")


def notice():
    """Whether a test fails."""
    return any(not run("ctest", "--test-dir", "build", "-j2", "--stop-on-failure", "-R", tests,
                       "--timeout", str(TEST_SECONDS), seconds=2 * TEST_SECONDS)
               for tests in TESTS)


def copy_sources():
    """Brings the copy up to date; what is the same stays as old as it is and is not built anew."""
    files = subprocess.run(["git", "ls-files", "-z"], cwd=ROOT, capture_output=True, check=True)
    copies = {PLACE / "source" / name: ROOT / name
              for name in files.stdout.decode().split("\0") if (ROOT / name).is_file()}
    for copy, original in copies.items():
        if not copy.is_file() or copy.read_bytes() != original.read_bytes():
            copy.parent.mkdir(parents=True, exist_ok=True)
            shutil.copy(original, copy)
    for stray in (PLACE / "source").rglob("*"):
        if stray.is_file() and stray not in copies:
            stray.unlink()


def try_out(path, number, fault):
    """What becomes of a fault: caught, survived, or no fault at all as it does not compile."""
    file = PLACE / "source" / path
    sound = file.read_text(encoding="utf-8")
    lines = sound.splitlines()
    was, lines[number] = lines[number], fault
    file.write_text("\n".join(lines) + "\n", encoding="utf-8")
    outcome = "not compiled"
    if build():
        outcome = "caught" if notice() else "survived"
    file.write_text(sound, encoding="utf-8")
    if outcome != "not compiled":
        print(f"{outcome} {path}:{number + 1}: {was.strip()}  =>  {fault.strip() or '(nothing)'}",
              flush=True)
    return outcome


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("folders", nargs="*", default=FOLDERS)
    parser.add_argument("--count", type=int, default=200)
    parser.add_argument("--seed", type=int, default=20261124)
    arguments = parser.parse_args()
    copy_sources()
    if not (run(*CONFIGURE) and build()) or notice():
        print("the tests fail without any fault", file=sys.stderr)
        return 1
    faults = list(all_faults(arguments.folders))
    random.Random(arguments.seed).shuffle(faults)
    score = {}
    for fault in faults:
        outcome = try_out(*fault)
        if outcome != "not compiled":
            score.setdefault(fault[0].parts[0], Counter())[outcome] += 1
        if sum(counter.total() for counter in score.values()) == arguments.count:
            break
    for folder, counter in sorted(score.items()):
        print(f"{folder:12}{counter['caught']:4} of {counter.total():4} caught")
    return 0


if __name__ == "__main__":
    sys.exit(main())
