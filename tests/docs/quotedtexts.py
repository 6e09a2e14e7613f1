"""Checks that the texts which pages quote are in the sources.

These are the lines of `log` blocks, apart from the values in them, and what stands in double quotes in
the running text. They are compared with the literals of C++ and QML files.
"""

import argparse
import re
import sys
from pathlib import Path

LITERAL = r'"(?:[^"\\\n]|\\.)*"'
LITERALS = re.compile(rf"(?:\bR\"\((?P<raw>.*?)\)\"|{LITERAL}(?:\s*{LITERAL})*)", re.DOTALL)
FENCED = re.compile(r"^```(\w*)\n(.*?)^```", re.MULTILINE | re.DOTALL)
VALUE = r'"[^"]*"|\b\d+\b'
INLINE_CODE = re.compile(r"`[^`\n]*`")


def literals_of(folders):
    """All literals, those that stand one behind the other as one; values are left out of them."""
    found = set()
    for folder in folders:
        for file in sorted(folder.rglob("*")):
            if file.suffix not in (".cpp", ".h", ".qml") or not file.is_file():
                continue
            for match in LITERALS.finditer(file.read_text(encoding="utf-8")):
                parts = re.findall(LITERAL, match.group()) if match["raw"] is None else []
                text = match["raw"] or "".join(part[1:-1] for part in parts)
                found.add(text.replace(r"\"", '"').replace(r"\n", " "))
    return found


def pattern_of(literal):
    """What a literal with placeholders looks like, once quoted values are gone; none for others."""
    bare = re.sub(r'"%(\d|s)"', "", literal).strip()
    parts = re.split(r"%\d|%s", bare)
    if len(parts) == 1 or len("".join(parts)) < 8:
        return None
    return ".+".join(re.escape(part) for part in parts)


def is_quoted(text, literals):
    """Whether a piece of a line stands in a literal, where a value may take the place of %1.

    What is streamed comes in several literals, one behind the other.
    """
    text = text.strip()
    if any(text in literal for literal in literals):
        return True
    begins = (literal.strip() for literal in literals)
    if any(begin and text.startswith(begin + " ") and is_quoted(text[len(begin):], literals)
           for begin in begins):
        return True
    return any(re.fullmatch(pattern, text) for pattern in map(pattern_of, literals) if pattern)


def quotations(text):
    """Each text that the page quotes, with its line."""
    for block in FENCED.finditer(text):
        if block[1] == "log":
            first = text.count("\n", 0, block.start(2)) + 1
            for number, line in enumerate(block[2].splitlines(), first):
                for piece in re.split(VALUE, line):
                    if piece.strip():
                        yield number, piece
    prose = FENCED.sub(lambda block: "\n" * block.group().count("\n"), text)
    for number, line in enumerate(prose.splitlines(), 1):
        for quoted in re.findall(r'"([^"]+)"', INLINE_CODE.sub("", line)):
            yield number, quoted


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--sources", nargs="+", type=Path, required=True)
    parser.add_argument("--pages", nargs="+", type=Path, required=True)
    arguments = parser.parse_args()
    literals = literals_of(arguments.sources)
    faults = 0
    for page in arguments.pages:
        found = list(quotations(page.read_text(encoding="utf-8")))
        wrong = [quote for quote in found if not is_quoted(quote[1], literals)]
        for number, text in wrong:
            print(f"{page.name}:{number}: not in the sources: {text.strip()}")
        if not found:
            print(f"{page.name}: quotes nothing")
        print(f"{page.name}: {len(found)} quotations")
        faults += len(wrong) + (not found)
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
