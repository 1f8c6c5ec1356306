#!/usr/bin/env python3
"""Runs clang-tidy over all that a build folder compiles, or over the files that begin so:

    tools/check_tidy.py build/check
    tools/check_tidy.py build/windows windows_

What clang-tidy costs is mostly the libraries' headers, which it reads whole for each file. So the
files of one library or program are looked at as one text; where they do not go together, as two
of them use one name for things of their own, as two texts, and so on. What was found clean is not
read again until something that the finding rests on changes: the files, a header of ours that they
include, the way they are compiled, .clang-tidy, clang-tidy itself or this script.
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

# The sanitizers watch the tests anyway.
FEWER_IN_TESTS = ["--checks=-clang-analyzer-*"]
# A third of the time of the deep search, and of faults put in for a trial it found as many.
ANALYZER = ["-Xclang", "-analyzer-config", "-Xclang", "mode=shallow"]


def run(*command):
    return subprocess.run(command, cwd=ROOT, capture_output=True, text=True, check=False)


def dependencies(build):
    """What each object file was made from, as the last build saw it."""
    found, current = {}, None
    for line in run("ninja", "-C", str(build), "-t", "deps").stdout.splitlines():
        if line.startswith(" "):
            current.append(line.strip())
        elif ": #deps" in line:
            current = found.setdefault(line.split(": #deps")[0], [])
    return found


def machine_flags(compiler):
    """What tells clang-tidy of another machine that the compiler compiles for."""
    machine = run(compiler, "-dumpmachine").stdout.strip()
    if machine == run("c++", "-dumpmachine").stdout.strip():
        return []
    said = run(compiler, "-E", "-v", "-x", "c++", "/dev/null").stderr
    folders = said.split("#include <...> search starts here:\n")[1].split("\nEnd of search")[0]
    # A compiler's own headers are for it alone.
    return [f"--target={machine}"] + [
        f"-isystem{folder}" for folder in folders.split()
        if not re.search(r"/lib/(gcc/[^/]+|clang)/[^/]+/include(-fixed)?$", folder)]


def in_root(path):
    return str(path.relative_to(ROOT))


class Unit:
    """Files that are compiled in the same way."""

    def __init__(self, flags):
        self.flags = flags
        self.files = []  # paths from the root
        self.headers = set()

    def fingerprint(self, common):
        digest = hashlib.sha256(common + " ".join(self.flags).encode())
        for name in [*self.files, *sorted(self.headers)]:
            digest.update(name.encode() + (ROOT / name).read_bytes())
        return digest.hexdigest()


def write_as_one(files, path):
    """Writes the files as one, with each header once; returns which line begins which file."""
    lines, seen, starts = [], set(), []
    for name in files:
        starts.append((len(lines), name))
        text = (ROOT / name).read_text(encoding="utf-8").splitlines()
        lines += ["" if line in seen else line for line in text]
        seen.update(line for line in text if line.startswith("#include"))
    path.write_text("\n".join(lines) + "\n", encoding="utf-8")
    return starts


def read_units(build, beginning):
    """The units of a build, by the names of the libraries and programs that they are built into."""
    units, objects, machines = {}, dependencies(build), {}
    for entry in json.loads((build / "compile_commands.json").read_text(encoding="utf-8")):
        file = Path(entry["file"]).resolve()
        if (not file.is_relative_to(ROOT) or file.is_relative_to(ROOT / "build")
                or not file.name.startswith(beginning)):
            continue
        compiler, *words = shlex.split(entry["command"])
        if compiler not in machines:
            machines[compiler] = machine_flags(compiler)
        output = words[words.index("-o") + 1]
        name = re.search(r"CMakeFiles/(.+?)\.dir/", output)[1]
        unit = units.setdefault(name, Unit(machines[compiler] + words[:words.index("-o")]))
        unit.files.append(in_root(file))
        used = ((build / header).resolve() for header in objects.get(output, []))
        unit.headers.update(in_root(path) for path in used
                            if path.is_relative_to(ROOT) and path.is_file())
    return units


def look(path, flags, is_test):
    """The findings in a file; empty if it is clean."""
    fewer = FEWER_IN_TESTS if is_test else []
    result = run("clang-tidy", "--quiet", f"--config-file={ROOT / '.clang-tidy'}", *fewer,
                 str(path), "--", *flags, f"-I{ROOT}", *ANALYZER)
    return (result.stdout or result.stderr or "clang-tidy failed") if result.returncode else ""


def with_places(findings, path, starts):
    """Names the files themselves, not the text that they were put into."""
    def place(match):
        line = int(match[1])
        start, name = next(pair for pair in reversed(starts) if pair[0] < line)
        return f"{ROOT / name}:{line - start}:"
    return re.sub(rf"{re.escape(str(path))}:(\d+):", place, findings)


def look_at(files, flags, path):
    """The findings in some files, which are put together at the path."""
    is_test = files[0].startswith(("bench/", "fuzz/", "tests/"))
    if len(files) == 1:
        return look(ROOT / files[0], flags, is_test)
    starts = write_as_one(files, path)
    findings = look(path, flags, is_test)
    if "clang-diagnostic" not in findings:
        return with_places(findings, path, starts)
    half = len(files) // 2
    return look_at(files[:half], flags, path) + look_at(files[half:], flags, path)


def say_once(findings, said):
    """Prints findings but for those in a header that another file has brought up already."""
    for finding in re.split(r"^(?=/\S+:\d+:\d+: (?:error|warning))", findings, flags=re.MULTILINE):
        if finding not in said:
            said.add(finding)
            print(finding.replace(f"{ROOT}/", "").rstrip("\n"), flush=True)


def main():
    build = Path(sys.argv[1]).resolve()
    folder = build / "tidy"
    folder.mkdir(exist_ok=True)
    common = run("clang-tidy", "--version").stdout.encode()
    common += (ROOT / ".clang-tidy").read_bytes() + Path(__file__).read_bytes()
    units = read_units(build, sys.argv[2] if len(sys.argv) > 2 else "")
    marks = {name: unit.fingerprint(common) for name, unit in units.items()}
    kept = folder / "clean.json"
    clean = json.loads(kept.read_text(encoding="utf-8")) if kept.is_file() else {}
    clean = {name: mark for name, mark in clean.items() if marks.get(name) == mark}
    changed = [name for name in units if name not in clean]
    said = set()
    with ThreadPoolExecutor(os.cpu_count()) as pool:
        results = pool.map(lambda name: look_at(
            units[name].files, units[name].flags, folder / f"{name}.cpp"), changed)
        for name, findings in zip(changed, results):
            if findings:
                say_once(findings, said)
            else:
                clean[name] = marks[name]
    kept.write_text(json.dumps(clean, indent=1), encoding="utf-8")
    faulty = len(units) - len(clean)
    print(f"{sum(len(unit.files) for unit in units.values())} files in {len(units)} libraries and "
          f"programs, {len(changed)} of them looked at, {faulty} with findings")
    return 1 if faulty else 0


if __name__ == "__main__":
    sys.exit(main())
