"""page_is_whole.py PAGE FOLDER

Fails when the page does not show what a program in the folder prints, whole: each *.expected is a
block of its own. Of steps, stepNN beside each other, it fails too when the section "NN. ..." does not
show a line that the step before did not have, so that a reader who follows the page has the step, and
when it shows a line that the step has not.
"""

import pathlib
import re
import sys

BLOCK = re.compile(r"^```(\w+)\n(.*?)^```$", re.MULTILINE | re.DOTALL)


def code_lines(text):
    """The lines that count; which header a class needs its name tells."""
    lines = (line.strip() for line in text.splitlines())
    return [line for line in lines if len(line) > 1 and not line.startswith("#")]


def sections(page):
    """The text of each numbered section."""
    parts = re.split(r"^## (\d+)\. ", page, flags=re.MULTILINE)
    return {int(number): text for number, text in zip(parts[1::2], parts[2::2])}


def sources(step):
    return sorted(step.glob("*.cpp")) + sorted(step.glob("*.h"))


def blocks(text, wanted):
    return [block for language, block in BLOCK.findall(text) if language == wanted]


def missing_outputs(page, folder):
    shown = blocks(page, "text")
    for expected in sorted(folder.rglob("*.expected")):
        if expected.read_text() not in shown:
            yield f"what {expected} says is not shown as it is"


def wrong_lines(page, folder):
    shared = [line for header in folder.glob("*.h") for line in code_lines(header.read_text())]
    before = set()
    for step in sorted(folder.glob("step*")):
        number = int(step.name[len("step"):])
        section = sections(page).get(number, "")
        shown = [line for block in blocks(section, "cpp") for line in code_lines(block)]
        own = [line for source in sources(step) for line in code_lines(source.read_text())]
        for line in own:
            if line not in before and line not in shown:
                yield f"section {number} does not show what is new in {step.name}: {line}"
        for line in shown:
            if line not in own and line not in shared:
                yield f"section {number} shows what {step.name} has not: {line}"
        before = set(own)


def main(page_name, folder_name):
    page, folder = pathlib.Path(page_name).read_text(), pathlib.Path(folder_name)
    faults = [*missing_outputs(page, folder), *wrong_lines(page, folder)]
    if not list(folder.rglob("*.expected")):
        faults.append("there is no output to show")
    print("\n".join(faults))
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
