#!/bin/sh
# Checks the help pages: valid HTML, no scripts, nothing from outside, every link, anchor and
# picture there, no picture too many, and a page for each topic that the program names. Prints a
# line for each fault. Needs tidy.
cd "$(dirname "$0")/.." || exit 1
faults=0
for page in help/*.htm; do
  tidy -errors -quiet "$page" 2>&1 | sed "s|^|$page: |" | grep . && faults=1
done
python3 - <<'PYTHON' || faults=1
import re
import sys
from html.parser import HTMLParser
from pathlib import Path
from urllib.parse import unquote, urlsplit

HELP = Path("help")


class Page(HTMLParser):
    def __init__(self, path):
        super().__init__()
        self.anchors, self.links, self.scripts = set(), [], 0
        self.feed(path.read_text(encoding="utf-8"))

    def handle_starttag(self, tag, attributes):
        given = dict(attributes)
        self.anchors.add(given.get("id"))
        self.links += [given[name] for name in ("href", "src") if name in given]
        if given.get("http-equiv") == "refresh":
            self.links.append(given["content"].partition("url=")[2])
        self.scripts += tag == "script" or any(name.startswith("on") for name in given)


pages = {path.name: Page(path) for path in sorted(HELP.glob("*.htm"))}
faults = [f"{name}: a script" for name, page in pages.items() if page.scripts]
used = set()
for name, page in pages.items():
    for link in page.links:
        parts = urlsplit(link)
        target = unquote(parts.path) or name
        used.add(target)
        if parts.scheme or parts.netloc:
            faults.append(f"{name}: {link} leads outside")
        elif not (HELP / target).is_file():
            faults.append(f"{name}: {link} is not there")
        elif parts.fragment and parts.fragment not in pages[target].anchors:
            faults.append(f"{name}: {link} has no such anchor")
for picture in sorted(HELP.glob("pictures/*")):
    if picture.relative_to(HELP).as_posix() not in used:
        faults.append(f"{picture}: on no page")
for source in sorted(Path("shell").rglob("*.cpp")):
    for page, topic in re.findall(r'"file:([\w.]+)#(\w+)"', source.read_text(encoding="utf-8")):
        if page not in pages or topic not in pages[page].anchors:
            faults.append(f"{source}: the help has no {page}#{topic}")
        if f"{Path(page).stem}-{topic}.htm" not in pages:
            faults.append(f"{source}: {page}#{topic} has no page of its own")
print(*faults, sep="\n", end="\n" if faults else "")
sys.exit(bool(faults))
PYTHON
exit $faults
