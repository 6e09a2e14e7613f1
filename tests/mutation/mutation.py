"""One change to the library's source, as the files in the folder mutations tell it.

    = what goes wrong
    file named/namedstate.cpp
      a line that stays
    - a line that goes
    + a line that comes

A line of code stands behind two characters. What stays and what goes has to be found once in the
file, as whole lines, wherever that is.
"""

from pathlib import Path


class Unusable(Exception):
    """A mutation that cannot be read or has no place in the source."""


class Mutation:
    def __init__(self, name, where):
        self.name = name
        self.where = where
        self.file = ""
        self.before = []
        self.after = []

    def read(self, line):
        mark, code = line[:1], line[2:]
        if line.startswith("file "):
            self.file = line[len("file "):]
        elif mark in ("-", "+", " ") and line[1:2] in ("", " "):
            if mark != "+":
                self.before.append(code)
            if mark != "-":
                self.after.append(code)
        else:
            raise Unusable(f"{self.where}: {self.name}: cannot be read: {line}")

    def check(self):
        if not self.file or not self.before or self.before == self.after:
            raise Unusable(f"{self.where}: {self.name}: names no file or changes nothing")

    def apply(self, text):
        """The text of the file with the change."""
        before = "\n" + "\n".join(self.before) + "\n"
        found = ("\n" + text).count(before)
        if found != 1:
            raise Unusable(f"{self.where}: {self.name}: is found {found} times in {self.file}, "
                           "and has to be found once")
        after = "".join(f"\n{line}" for line in self.after) + "\n"
        return ("\n" + text).replace(before, after)[1:]

    def test_stem(self):
        return Path(self.file).stem


def read_mutations(path):
    result = []
    for line in path.read_text().splitlines():
        line = line.rstrip()
        if line.startswith("= "):
            result.append(Mutation(line[2:], path.name))
        elif line:
            if not result:
                raise Unusable(f"{path.name}: a line before the first mutation: {line}")
            result[-1].read(line)
    return result


def read_all(folder):
    mutations = [m for path in sorted(folder.glob("*.txt")) for m in read_mutations(path)]
    names = set()
    for mutation in mutations:
        mutation.check()
        if mutation.name in names:
            raise Unusable(f"{mutation.where}: {mutation.name}: stands there twice")
        names.add(mutation.name)
    return mutations


# Nothing there can go wrong: a destructor that is written out.
WITHOUT_CODE = {"hmi/hmitargetfilter.cpp"}


def missing_files(mutations, library):
    """Sources of the library without a mutation."""
    covered = {m.file for m in mutations}
    sources = {str(path.relative_to(library)) for path in library.glob("*/*.cpp")}
    return sorted(sources - covered - WITHOUT_CODE)
