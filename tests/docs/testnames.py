"""Checks that the tests which pages name are there, and that each rule names one.

A page names a test as `tst_Class::function` or `tst_Class::function:row`. The test programs tell
themselves which functions and rows they run.
"""

import argparse
import os
import re
import subprocess
import sys
from pathlib import Path

NAME = re.compile(r"`(tst_[^`]*)`")
PARTS = re.compile(r"(tst_\w+)::(\w+)(?::(.+))?")
FENCED = re.compile(r"^```.*?^```", re.MULTILINE | re.DOTALL)


def functions_of(program):
    """The functions that a program runs, each with the tags of its rows."""
    environment = dict(os.environ, QT_QPA_PLATFORM="offscreen")
    listing = subprocess.run([program, "-datatags"], env=environment, text=True, check=True,
                             stdout=subprocess.PIPE, stderr=subprocess.DEVNULL).stdout
    functions = {}
    for line in listing.splitlines():
        test, function, *tag = line.split(" ", 2)
        functions.setdefault(f"{test}::{function}", set()).update(tag)
    return functions


class Programs:
    def __init__(self, folder):
        self.folder = Path(folder)
        self.functions = {}

    def fault(self, name):
        """What is wrong with the name of a test; nothing when it is that of one."""
        parts = PARTS.fullmatch(name)
        if not parts:
            return "is not tst_Class::function or tst_Class::function:row"
        test, function, row = parts.groups()
        if test not in self.functions:
            program = self.folder / test.lower()
            self.functions[test] = functions_of(program) if program.is_file() else {}
        rows = self.functions[test].get(f"{test}::{function}")
        if rows is None:
            return "is not run by a program"
        if row and row not in rows:
            return "has no such row"
        return None


def rows_of(text):
    """Each row of a table whose last column is that of tests, with the line it is in."""
    in_table = False
    for number, line in enumerate(text.splitlines(), 1):
        if not line.startswith("|"):
            in_table = False
        elif re.search(r"\| Tests? \|$", line):
            in_table = True
        elif in_table and not line.startswith("|---"):
            yield number, line


def sections_of(text):
    """Each section of the third level, with the line it begins in."""
    starts = [match.start() for match in re.finditer(r"^#{1,3} ", text, re.MULTILINE)]
    for start, end in zip(starts, starts[1:] + [len(text)]):
        if text.startswith("### ", start):
            yield text.count("\n", 0, start) + 1, text[start:end]


def check(page, programs, faults):
    # Emptied, not cut out, so that the numbers of lines stay.
    text = FENCED.sub(lambda block: "\n" * block.group().count("\n"),
                      page.read_text(encoding="utf-8"))
    names = 0
    for number, line in enumerate(text.splitlines(), 1):
        for name in NAME.findall(line):
            names += 1
            fault = programs.fault(name)
            if fault:
                faults.append(f"{page.name}:{number}: {name} {fault}")
    rules = list(rows_of(text)) or list(sections_of(text))
    for number, rule in rules:
        if not NAME.search(rule):
            faults.append(f"{page.name}:{number}: no test is named: {rule.splitlines()[0]}")
    if not names or not rules:
        faults.append(f"{page.name}: {names} names of tests, {len(rules)} rules")
    print(f"{page.name}: {len(rules)} rules, {names} names of tests")


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--programs", required=True, help="the folder of the test programs")
    parser.add_argument("pages", nargs="+", type=Path)
    arguments = parser.parse_args()
    programs = Programs(arguments.programs)
    faults = []
    for page in arguments.pages:
        check(page, programs, faults)
    print("\n".join(faults))
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
