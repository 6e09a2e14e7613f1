"""Checks that links from page to page lead to a file, and to a heading that it has."""

import argparse
import re
import sys
from collections import Counter
from pathlib import Path

LINK = re.compile(r"(?<!\\)\]\(([^()\s]+)\)")
FENCED = re.compile(r"^```.*?^```", re.MULTILINE | re.DOTALL)
CODE = re.compile(r"`[^`\n]*`")


def anchors_of(page):
    """Headings as GitHub and its like make anchors of them."""
    text = FENCED.sub("", page.read_text(encoding="utf-8"))
    anchors = Counter()
    for heading in re.findall(r"^#+ +(.+?) *$", text, re.MULTILINE):
        anchor = re.sub(r"[^\w\- ]", "", heading.lower()).replace(" ", "-")
        repeated = anchors[anchor]
        anchors[anchor] += 1
        if repeated:
            anchors[f"{anchor}-{repeated}"] += 1
    return anchors


def fault_of(page, link):
    if re.match(r"[a-z]+:", link):
        return None
    path, _, anchor = link.partition("#")
    target = (page.parent / path).resolve() if path else page.resolve()
    if not target.exists():
        return "leads to no file"
    if anchor and (target.suffix != ".md" or anchor not in anchors_of(target)):
        return "leads to no heading"
    return None


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("pages", nargs="+", type=Path)
    links = faults = 0
    for page in parser.parse_args().pages:
        text = FENCED.sub(lambda block: "\n" * block.group().count("\n"),
                          page.read_text(encoding="utf-8"))
        for number, line in enumerate(text.splitlines(), 1):
            for link in LINK.findall(CODE.sub("", line)):
                links += 1
                fault = fault_of(page, link)
                if fault:
                    faults += 1
                    print(f"{page}:{number}: {link} {fault}")
    print(f"{links} links")
    return 1 if faults or not links else 0


if __name__ == "__main__":
    sys.exit(main())
