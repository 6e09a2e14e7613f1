#!/usr/bin/env python3
"""Prepares one file for Doxygen, which runs this for each of its inputs.

A header is put into the group of its folder. What its declarations tell by themselves is filled in
where there is no comment: the functions of a property, and the property of a notify signal. A
destructor without a comment is left out. A page of the guide gets the anchors that its links name, and its links are turned into references, so that
Doxygen warns of one that leads nowhere. Lines keep their numbers.
"""

import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parents[2]
GROUPS = {
    "src/HmiStateMachine/named": "named",
    "src/HmiStateMachine/hmi": "hmi",
    "src/HmiStateMachine/popup": "popup",
    "src/HmiStateMachineQuick": "quick",
}
END_OF_COMMENT = re.compile(r"( |/\*\* .*)\*/")  # of one that is not indented: a class, a function
DESTRUCTOR = re.compile(r"    (virtual )?~\w+\(\)( override)?;")
COMMENT = re.compile(r" */?\*")
PROPERTY = re.compile(r"    Q_PROPERTY\((?P<rest>.*)")
NOTIFIER = re.compile(r"    void (?P<name>\w+Changed)\(.*\);")
HEADING = re.compile(r"(#{1,6}) +(.+?)\s*$")
CLASS = re.compile(r"^(?:class|struct) HMISTATEMACHINE(?:QUICK)?_EXPORT (\w+)", re.MULTILINE)
QT_ALONE = re.compile(r"(?<![\w:%/(])Qt(?![\w:])")  # the product, not the namespace
LINK = re.compile(r"(?<!!)\[([^\]]+)\]\((?![a-z]+:)([^)\s]+)\)")
IMAGE = re.compile(r"!\[([^\]]*)\]\((?![a-z]+:)([^)\s]+)\)")
LINK_OR_CODE = re.compile(r"(\[[^\]]*\]\([^)]*\)|`[^`]*`)")


def properties(lines):
    """The words of each Q_PROPERTY, by the number of its first line."""
    result = {}
    for number, line in enumerate(lines):
        if PROPERTY.fullmatch(line):
            text = " ".join(lines[number:number + 3])
            result[number] = re.split(r"[\s*]+", text[text.index("(") + 1:text.index(")")])
    return result


def property_comment(words):
    """How a property is read, written and announced, from its own words."""
    def after(keyword):
        return words[words.index(keyword) + 1] if keyword in words else ""

    reader = after("READ") or words[words.index("MEMBER") - 1]
    ways = [f"Read by {reader}()"]
    if after("WRITE"):
        ways.append(f"written by {after('WRITE')}()")
    elif "MEMBER" in words:
        ways.append("written by QML or setProperty()")
    ways.append(f"announced by {after('NOTIFY')}()" if after("NOTIFY") else "always the same")
    return f"/** {', '.join(ways)}. */"


def is_commented(result):
    return bool(result) and result[-1].rstrip().endswith("*/")


def header(path, lines):
    group = GROUPS[path.parent.relative_to(ROOT).as_posix()]
    declared = properties(lines)
    notifiers = {}
    for words in declared.values():
        if "NOTIFY" in words:
            name = words[words.index("READ" if "READ" in words else "MEMBER") - 1]
            notifiers.setdefault(words[words.index("NOTIFY") + 1], []).append(name)
    result = []
    for number, line in enumerate(lines):
        signal = NOTIFIER.fullmatch(line)
        if END_OF_COMMENT.fullmatch(line):
            line = f"{line[:-2]}@ingroup {group} */"
        elif is_commented(result):
            pass
        elif number in declared:
            line = f"{property_comment(declared[number])} {line}"
        elif signal and signal["name"] in notifiers:
            names = " or ".join(notifiers[signal["name"]])
            line = f"/** The property {names} has changed, and is stored by now. */ {line}"
        elif DESTRUCTOR.fullmatch(line):
            line = ""
        result.append(QT_ALONE.sub("%Qt", line) if COMMENT.match(line) else line)
    return result


def page_label(path):
    return "guide_" + path.stem.replace("-", "_").lower()


def slug(heading, known):
    """The anchor that a heading has where Markdown is read as GitHub does."""
    text = re.sub(r"[^\w\- ]", "", re.sub(r"\]\([^)]*\)", "]", heading).lower())
    anchor = text.strip().replace(" ", "-")
    known.append(anchor)
    count = known.count(anchor) - 1
    return f"{anchor}-{count}" if count else anchor


def heading_label(path, anchor):
    return page_label(path) + "__" + anchor.replace("-", "_")


def reference(path, match):
    link = match[2]
    text = re.sub(r"\s+", " ", match[1].replace("`", ""))  # a reference shows them as they are
    breaks = "\n" * match[1].count("\n")
    file_name, _, anchor = link.partition("#")
    target = (path.parent / file_name).resolve() if file_name else path
    if target.parent == ROOT / "docs" and target.suffix == ".md":
        label = heading_label(target, anchor) if anchor else page_label(target)
        return f"{breaks}[{text}](@ref {label})"
    if target.exists():
        # No part of the reference: named, not linked.
        name = target.relative_to(ROOT).as_posix()
        return match[1] if name in text else f"{match[1]} (`{name}`)"
    return f"[{text}](@ref missing_file__{re.sub(r'[^A-Za-z0-9]', '_', link)})"


def image(path, match):
    text, link = match.groups()
    name = pathlib.PurePosixPath(link).name
    return f"![{text}]({name})"


def public_classes():
    headers = (header for folder in GROUPS for header in (ROOT / folder).glob("*.h"))
    return {name for header in headers for name in CLASS.findall(header.read_text(encoding="utf-8"))}


def words(text, classes):
    """A class that is named in code becomes a link; the word Qt does not."""
    pieces = LINK_OR_CODE.split(text)
    for index, piece in enumerate(pieces):
        name = piece.strip("`")
        if name != piece and name in classes:
            pieces[index] = f"[{name}](@ref HmiStateMachine::{name})"
        elif index % 2 == 0:
            pieces[index] = QT_ALONE.sub("%Qt", piece)
    return "".join(pieces)


def prose(path, text, classes):
    text = IMAGE.sub(lambda match: image(path, match), text)
    return words(LINK.sub(lambda match: reference(path, match), text), classes)


def labelled(path, heading, known):
    """A heading with its anchor; the known ones are those above it."""
    marks, text = heading.groups()
    label = page_label(path) if len(marks) == 1 else heading_label(path, slug(text, known))
    return f"{marks} {text} {{#{label}}}"


def page(path, lines):
    result = []
    block = []  # lines of prose together, because a link may go on in the next one
    classes = public_classes()
    anchors = []
    fenced = False
    for line in lines + [""]:
        fence = line.lstrip().startswith("```")
        heading = None if fenced or "{#" in line else HEADING.fullmatch(line)
        if line and not (fenced or fence or heading):
            block.append(line)
            continue
        if block:
            result.append(prose(path, "\n".join(block), classes))
            block = []
        fenced = fenced != fence
        result.append(labelled(path, heading, anchors) if heading else line)
    return result[:-1]


def main():
    path = pathlib.Path(sys.argv[1]).resolve()
    lines = path.read_text(encoding="utf-8").split("\n")
    if path.suffix == ".h":
        lines = header(path, lines)
    else:
        lines = page(path, lines)
    sys.stdout.write("\n".join(lines))


main()
