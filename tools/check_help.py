#!/usr/bin/env python3
"""Checks the help pages: tools/check_help.py

Valid HTML, no scripts, nothing from outside, every link, anchor and picture there, no picture too
many, and a page for each topic that the program names. Prints a line for each fault; exits with 1
if there is one. Needs tidy.
"""

import re
import subprocess
import sys
from html.parser import HTMLParser
from pathlib import Path
from urllib.parse import unquote, urlsplit

ROOT = Path(__file__).resolve().parent.parent
HELP = ROOT / "help"


class Page(HTMLParser):
    def __init__(self, path):
        super().__init__()
        self.path = path
        self.anchors, self.links, self.scripts = set(), [], 0
        self.feed(path.read_text(encoding="utf-8"))

    def handle_starttag(self, tag, attributes):
        given = dict(attributes)
        self.anchors.add(given.get("id"))
        self.links += [given[name] for name in ("href", "src") if name in given]
        if given.get("http-equiv") == "refresh":
            self.links.append(given["content"].partition("url=")[2])
        self.scripts += tag == "script" or any(name.startswith("on") for name in given)


def html_faults(page):
    said = subprocess.run(["tidy", "-errors", "-quiet", page.path],
                          capture_output=True, text=True, check=False)
    return said.stderr.splitlines() + (["a script"] if page.scripts else [])


def link_faults(page, pages, used):
    """Also puts the files that a page leads to among those that are used."""
    for link in page.links:
        parts = urlsplit(link)
        target = unquote(parts.path) or page.path.name
        used.add(target)
        if parts.scheme or parts.netloc:
            yield f"{link} leads outside"
        elif not (HELP / target).is_file():
            yield f"{link} is not there"
        elif parts.fragment and parts.fragment not in pages[target].anchors:
            yield f"{link} has no such anchor"


def topic_faults(pages):
    """The topics that the program opens the help at."""
    for source in sorted((ROOT / "shell").rglob("*.cpp")):
        text = source.read_text(encoding="utf-8")
        for page, topic in re.findall(r'"file:([\w.]+)#(\w+)"', text):
            if page not in pages or topic not in pages[page].anchors:
                yield f"{source.name}: the help has no {page}#{topic}"
            if f"{Path(page).stem}-{topic}.htm" not in pages:
                yield f"{source.name}: {page}#{topic} has no page of its own"


def main():
    pages = {path.name: Page(path) for path in sorted(HELP.glob("*.htm"))}
    used = set()
    faults = [f"{name}: {fault}" for name, page in pages.items()
              for fault in (*html_faults(page), *link_faults(page, pages, used))]
    faults += [f"{picture.name}: on no page" for picture in sorted(HELP.glob("pictures/*"))
               if picture.relative_to(HELP).as_posix() not in used]
    faults += topic_faults(pages)
    print(*faults, sep="\n", end="\n" if faults else "")
    return bool(faults)


if __name__ == "__main__":
    sys.exit(main())
