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
PROPERTY = re.compile(r"    Q_PROPERTY\((?P<rest>.*)")
NOTIFIER = re.compile(r"    void (?P<name>\w+Changed)\(.*\);")
HEADING = re.compile(r"(#{1,6}) +(.+?)\s*$")
LINK = re.compile(r"(?<!!)\[([^\]]+)\]\((?![a-z]+:)([^)\s]+)\)")
IMAGE = re.compile(r"!\[([^\]]*)\]\((?![a-z]+:)([^)\s]+)\)")
CODE_SPAN = re.compile(r"(`[^`]*`)")


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
    ways = [f"read by {reader}()"]
    if after("WRITE"):
        ways.append(f"written by {after('WRITE')}()")
    elif "MEMBER" in words:
        ways.append("written by QML or setProperty()")
    ways.append(f"announced by {after('NOTIFY')}()" if after("NOTIFY") else "always the same")
    return f"/** A property: {', '.join(ways)}. */"


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
        result.append(line)
    return result


def page_label(path):
    return "guide_" + path.stem.replace("-", "_").lower()


def slug(heading):
    """The anchor that a heading has where Markdown is read as GitHub does."""
    text = re.sub(r"[^\w\- ]", "", re.sub(r"\]\([^)]*\)", "]", heading).lower())
    return text.strip().replace(" ", "-")


def heading_label(path, anchor):
    return page_label(path) + "__" + anchor.replace("-", "_")


def reference(path, match):
    text, link = match.groups()
    file_name, _, anchor = link.partition("#")
    target = (path.parent / file_name).resolve() if file_name else path
    if target.parent == ROOT / "docs" and target.suffix == ".md":
        label = heading_label(target, anchor) if anchor else page_label(target)
        return f"[{text}](@ref {label})"
    if target.exists():
        # No part of the reference: named, not linked.
        name = target.relative_to(ROOT).as_posix()
        return text if name in text else f"{text} (`{name}`)"
    return f"[{text}](@ref missing_file__{re.sub(r'[^A-Za-z0-9]', '_', link)})"


def image(path, match):
    text, link = match.groups()
    name = pathlib.PurePosixPath(link).name
    return f"![{text}]({name})"


def prose(path, line):
    """Links and images of a line; a link's text may itself be code."""
    line = IMAGE.sub(lambda match: image(path, match), line)
    return LINK.sub(lambda match: reference(path, match), line)


def page(path, lines):
    result = []
    fenced = False
    for line in lines:
        if line.lstrip().startswith("```"):
            fenced = not fenced
        heading = None if fenced else HEADING.fullmatch(line)
        if heading and len(heading[1]) == 1:
            line = f"# {heading[2]} {{#{page_label(path)}}}"
        elif heading:
            line = f"{heading[1]} {heading[2]} {{#{heading_label(path, slug(heading[2]))}}}"
        elif not fenced:
            line = prose(path, line)
        result.append(line)
    return result


def main():
    path = pathlib.Path(sys.argv[1]).resolve()
    lines = path.read_text(encoding="utf-8").split("\n")
    if path.suffix == ".h":
        lines = header(path, lines)
    elif path.parent == ROOT / "docs":
        lines = page(path, lines)
    sys.stdout.write("\n".join(lines))


main()
