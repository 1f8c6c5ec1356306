#!/usr/bin/env python3
"""Runs clang-tidy over all that a build folder compiles: tools/check_tidy.py build/check

A file that was found clean is not read again until something that the finding rests on changes: the
file, a header of ours that it includes, the way it is compiled, .clang-tidy or clang-tidy itself.
Exits with 1 if there is a finding.
"""

import hashlib
import json
import os
import re
import shlex
import subprocess
import sys
from concurrent.futures import ThreadPoolExecutor
from pathlib import Path

ROOT = Path(__file__).resolve().parent.parent


def run(*command):
    return subprocess.run(command, cwd=ROOT, capture_output=True, text=True)


def dependencies(build):
    """What each object file was made from, as the last build saw it."""
    found, current = {}, None
    for line in run("ninja", "-C", str(build), "-t", "deps").stdout.splitlines():
        if line.startswith(" "):
            current.append(line.strip())
        elif ": #deps" in line:
            current = found.setdefault(line.split(": #deps")[0], [])
    return found


class Units:
    """The files to look at, each with a fingerprint of all that its finding rests on."""

    def __init__(self, build):
        self.common = run("clang-tidy", "--version").stdout.encode()
        self.common += (ROOT / ".clang-tidy").read_bytes()
        self.fingerprints = {}
        objects = dependencies(build)
        for entry in json.loads((build / "compile_commands.json").read_text()):
            file = Path(entry["file"]).resolve()
            if file.is_relative_to(ROOT) and not file.is_relative_to(build):
                words = shlex.split(entry["command"])
                headers = objects.get(words[words.index("-o") + 1], [])
                self.fingerprints[str(file.relative_to(ROOT))] = self.fingerprint(
                    entry["command"], build, [str(file), *headers])

    def fingerprint(self, command, build, files):
        digest = hashlib.sha256(self.common + command.encode())
        for name in sorted({(build / file).resolve() for file in files}):
            if name.is_relative_to(ROOT) and name.is_file():
                digest.update(str(name).encode() + name.read_bytes())
        return digest.hexdigest()


def look_at(build, file):
    """The findings in a file; empty if it is clean."""
    # The analyzer takes half of the time, and the sanitizers watch the tests anyway.
    fewer = ["--checks=-clang-analyzer-*"] if file.startswith("tests/") else []
    result = run("clang-tidy", "--quiet", *fewer, "-p", str(build), file)
    return (result.stdout or result.stderr or "clang-tidy failed") if result.returncode else ""


def say_once(findings, said):
    """Prints findings but for those in a header that another file has brought up already."""
    for finding in re.split(r"^(?=/\S+:\d+:\d+: (?:error|warning))", findings, flags=re.MULTILINE):
        if finding not in said:
            said.add(finding)
            print(finding.replace(f"{ROOT}/", "").rstrip("\n"), flush=True)


def main():
    build = Path(sys.argv[1]).resolve()
    units = Units(build).fingerprints
    kept = build / "tidy_clean.json"
    clean = json.loads(kept.read_text()) if kept.is_file() else {}
    clean = {file: mark for file, mark in clean.items() if units.get(file) == mark}
    changed = [file for file in sorted(units) if file not in clean]
    with ThreadPoolExecutor(os.cpu_count()) as pool:
        results = pool.map(lambda file: (file, look_at(build, file)), changed)
        said = set()
        for file, findings in results:
            if findings:
                say_once(findings, said)
            else:
                clean[file] = units[file]
    kept.write_text(json.dumps(clean, indent=1))
    faulty = len(units) - len(clean)
    print(f"{len(units)} files, {len(changed)} of them looked at, {faulty} with findings")
    return 1 if faulty else 0


if __name__ == "__main__":
    sys.exit(main())
