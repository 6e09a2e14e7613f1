#!/usr/bin/env python3
"""Changes the library in many small ways, one after the other, and tells which its tests notice."""

import argparse
import fnmatch
import sys
import time
from pathlib import Path

from mutation import Unusable, missing_files, read_all
from workcopy import WorkCopy

HERE = Path(__file__).resolve().parent
PROJECT = HERE.parent.parent
LIBRARY = Path("src/HmiStateMachine")

# Whose tests are run first, where that is not plain from the name of the file.
LIKELY = {
    "childchecks": ["childchecks", "namedstate"],
    "exclusivelayer": ["layeredsources", "hmilayeredstate"],
    "hmibackevent": ["simpleevent", "backnavigation"],
    "hmievent": ["simpleevent", "hmitransition"],
    "hmifallbackevent": ["simpleevent", "fallbackviews", "hmifallback"],
    "hmiviewevent": ["simpleevent", "viewrequest"],
    "metatypes": ["viewstatetarget", "hmistate", "namedstate", "guarded"],
    "owntransition": ["hmiviewstate"],
    "popupevent": ["simpleevent", "popuptransition", "popuprequest"],
    "rulename": ["popupinterruptionstore", "interruptionlookup"],
    "siblinggroups": ["arbitration", "guarded", "simpleeventtransition", "keysignal"],
    "slotconnection": ["keysignal", "popupwiring", "popupstate"],
    "targetindex": ["targetlookup", "hmiviewtransition", "popupstate"],
}
# They take longest.
LAST = ["popuprandom", "interruptionlookup", "targetlookup"]


class DoesNotBuild(Exception):
    """A mutation that is no C++."""


class Check:
    def __init__(self, copy, results):
        self.copy = copy
        self.results = results
        self.names = []
        self.survivors = []
        self.invalid = []
        self.killed = 0

    def prepare(self):
        self.copy.update()
        if not self.copy.configure() or not self.copy.build():
            raise Unusable(f"the library does not build as it is, see {self.copy.log}")
        self.names = self.copy.tests()
        failure = self.first_failure(self.names) if self.names else "there are no tests"
        if failure:
            raise Unusable(f"the tests have to pass without a mutation: {failure}")

    def try_mutation(self, mutation):
        path = self.copy.source / LIBRARY / mutation.file
        text = path.read_text()
        path.write_text(mutation.apply(text))
        try:
            killer = self.find_killer(mutation)
        except DoesNotBuild:
            self.invalid.append(mutation)
            return "INVALID: it does not build"
        finally:
            path.write_text(text)
        if killer:
            self.killed += 1
            return killer
        self.survivors.append(mutation)
        return "SURVIVED"

    def find_killer(self, mutation):
        for names in self.stages(mutation):
            # These programs alone: a header may be part of nearly all.
            if not self.copy.build(["HmiStateMachine"] + ["tst_" + name for name in names]):
                raise DoesNotBuild
            failure = self.first_failure(names)
            if failure:
                return f"killed by {failure}"
        return None

    def first_failure(self, names):
        """Who fails first, if anyone does."""
        while names:
            failure = self.copy.test(names)
            if not failure:
                break
            if not failure.timeout:
                return ", ".join(failure.names)
            # A busy machine is slow, too: only who is too slow alone as well has failed.
            for name in failure.names:
                if self.copy.test([name], jobs=1):
                    return f"{name}, which hangs"
            names = [name for name in names if name not in failure.names]
        return None

    def stages(self, mutation):
        """The likely tests, the others, and those that take long."""
        stem = mutation.test_stem()
        begin = tuple(LIKELY.get(stem, [stem]))
        likely = [name for name in self.names if name.startswith(begin) and name not in LAST[:1]]
        others = [name for name in self.names if name not in likely and name not in LAST]
        last = [name for name in LAST if name in self.names and name not in likely]
        return [likely, others, last]

    def tell(self, line):
        print(line, flush=True)
        with self.results.open("a") as file:
            file.write(line + "\n")


def parse_arguments():
    parser = argparse.ArgumentParser(prog="scripts/mutation", add_help=False)
    parser.add_argument("--only", action="append", default=[])
    parser.add_argument("--list", action="store_true")
    return parser.parse_args()


def choose(mutations, patterns):
    if not patterns:
        return mutations
    return [m for m in mutations
            if any(fnmatch.fnmatch(text, f"*{pattern}*")
                   for pattern in patterns for text in (m.name, m.file))]


def run(mutations, folder):
    folder.mkdir(parents=True, exist_ok=True)
    check = Check(WorkCopy(PROJECT, folder), folder / "results.txt")
    check.copy.log.write_text("")
    check.results.write_text("")
    print("Building, and testing without a mutation", flush=True)
    check.prepare()
    for number, mutation in enumerate(mutations, 1):
        begin = time.monotonic()
        outcome = check.try_mutation(mutation)
        seconds = time.monotonic() - begin
        check.tell(f"{number}/{len(mutations)} {mutation.file}: {mutation.name}: "
                   f"{outcome} ({seconds:.0f} s)")
    check.tell(f"{check.killed} of {check.killed + len(check.survivors)} mutations killed")
    for mutation in check.survivors:
        check.tell(f"SURVIVED {mutation.file}: {mutation.name}")
    for mutation in check.invalid:
        check.tell(f"INVALID {mutation.file}: {mutation.name}")
    return 1 if check.survivors or check.invalid else 0


def main():
    arguments = parse_arguments()
    everything = read_all(HERE / "mutations")
    for mutation in everything:
        mutation.apply((PROJECT / LIBRARY / mutation.file).read_text())
    missing = missing_files(everything, PROJECT / LIBRARY)
    if missing:
        raise Unusable("no mutation of " + ", ".join(missing))
    mutations = choose(everything, arguments.only)
    if not mutations:
        raise Unusable("no mutation is called so: " + ", ".join(arguments.only))
    if arguments.list:
        for mutation in mutations:
            print(f"{mutation.file}: {mutation.name}")
        return 0
    return run(mutations, PROJECT / "build" / "mutation")


if __name__ == "__main__":
    try:
        sys.exit(main())
    except Unusable as problem:
        sys.exit(f"mutation: {problem}")
