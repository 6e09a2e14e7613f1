"""Checks that each picture of a diagram is that of its source, shown somewhere, and names what there is.

scripts/diagrams writes the checksum of the source into the picture, so that Graphviz is not needed here.
"""

import argparse
import hashlib
import html
import re
import sys
from pathlib import Path

LABEL = re.compile(r'label="((?:[^"\\]|\\.)*)"')
FUNCTION = re.compile(r"\b(\w+)\(")
CLASS = re.compile(r"\b(?:Hmi|Popup|KeySignal|ParallelSibling)\w+\b")
TEXT = re.compile(r"<text[^>]*>(.*?)</text>", re.DOTALL)


def labels_of(source):
    """Each line of a label, of which a record has several fields."""
    for label in LABEL.findall(source):
        for line in re.split(r"\\n|\|", label):
            if line.strip():
                yield " ".join(line.split())


def faults_of(source_file, picture_file, headers):
    source = source_file.read_bytes()
    if not picture_file.is_file():
        return ["has no picture"]
    picture = picture_file.read_text(encoding="utf-8")
    faults = []
    if f"<!-- {source_file.name} {hashlib.sha256(source).hexdigest()} -->" not in picture:
        faults.append("has changed since its picture was drawn")
    shown = {" ".join(html.unescape(text).split()) for text in TEXT.findall(picture)}
    for line in labels_of(source.decode("utf-8")):
        if line not in shown:
            faults.append(f"its picture does not say: {line}")
        for name in FUNCTION.findall(line) + CLASS.findall(line):
            if not re.search(rf"\b{name}\b", headers):
                faults.append(f"no header has {name}")
    return faults


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--docs", type=Path, required=True)
    parser.add_argument("--headers", nargs="+", type=Path, required=True, help="folders of headers")
    arguments = parser.parse_args()
    headers = "\n".join(file.read_text(encoding="utf-8")
                        for folder in arguments.headers for file in sorted(folder.rglob("*.h")))
    pages = "\n".join(page.read_text(encoding="utf-8") for page in arguments.docs.glob("*.md"))
    faults = []
    sources = sorted((arguments.docs / "diagrams").glob("*.dot"))
    for source in sources:
        picture = arguments.docs / "images" / f"{source.stem}.svg"
        faults += [f"{source.name}: {fault}" for fault in faults_of(source, picture, headers)]
        if f"](images/{picture.name})" not in pages:
            faults.append(f"{source.name}: no page shows it")
    for picture in (arguments.docs / "images").glob("*.svg"):
        if "graph0" in picture.read_text(encoding="utf-8") and not any(
                source.stem == picture.stem for source in sources):
            faults.append(f"{picture.name}: has no source")
    print("\n".join(faults or [f"{len(sources)} diagrams"]))
    if faults:
        print("scripts/diagrams draws them anew")
    return 1 if faults or not sources else 0


if __name__ == "__main__":
    sys.exit(main())
