"""Compares the binary interface of a library with the one last committed, or commits to a new one.

    abi.py compare LIBRARY SOURCES REFERENCE
    abi.py write LIBRARY SOURCES REFERENCE

SOURCES is the folder with the library's headers. Needs abidw and abidiff (in Debian abigail-tools).
"""

import re
import subprocess
import sys
import tempfile
from pathlib import Path

from reduce import reduce_file

ABIDW = ["abidw", "--exported-interfaces-only", "--no-corpus-path", "--no-comp-dir-path",
         "--no-elf-needed", "--no-parameter-names", "--type-id-style", "hash"]
ABIDIFF = ["abidiff", "--no-show-locs"]

# What abidiff's exit code is made of.
TROUBLE = 1 | 2
CHANGE = 4
INCOMPATIBLE = 8

SUMMARY = re.compile(r"summary: (?P<counts>.*)")
COUNT = re.compile(r"(\d+) (removed|changed|added)", re.IGNORECASE)

ADVICE = """The binary interface of {library} is not that of {reference}:

{text}
This asks for a {step} step of the version{why}; see CONTRIBUTING.md. When it is meant, renew the file:
    cmake --build build/dev --target update-interface"""
WHY = {"major": ": programs must be built anew, or even changed",
       "minor": ": what programs use is still there, as it was"}


class Trouble(Exception):
    pass


def dump(library, sources, target):
    with tempfile.TemporaryDirectory() as folder:
        everything = Path(folder) / "everything.abi"
        done = subprocess.run(ABIDW + ["--out-file", everything, library], text=True,
                              capture_output=True, check=False)
        if done.returncode or not everything.exists():
            raise Trouble(f"abidw {library}: {done.returncode}\n{done.stdout}{done.stderr}")
        if not reduce_file(everything, target, Path(sources).absolute()):
            raise Trouble(f"{library} has no class out of headers in {sources}, or no debug information")


def abidiff(before, after, *options):
    done = subprocess.run([*ABIDIFF, *options, before, after], text=True, capture_output=True,
                          check=False)
    if done.returncode & TROUBLE:
        raise Trouble(f"abidiff: {done.returncode}\n{done.stdout}{done.stderr}")
    return done.returncode, done.stdout


def only_adds(text):
    """Whether abidiff's summaries count nothing as removed or changed; its exit code does not tell."""
    counts = [count for summary in SUMMARY.finditer(text)
              for count in COUNT.findall(summary.group("counts"))]
    if not counts:
        raise Trouble(f"abidiff gives no summary:\n{text}")
    return all(int(number) == 0 or kind.lower() == "added" for number, kind in counts)


def difference(before, after):
    """The step of the version that a change asks for, and abidiff's text; None when there is none."""
    code, text = abidiff(before, after)
    if code & CHANGE:
        return ("minor" if not code & INCOMPATIBLE and only_adds(text) else "major"), text
    code, text = abidiff(before, after, "--harmless")  # an enumerator behind all others, say
    return ("minor", text) if code & CHANGE else None


def compare(library, sources, reference):
    if not Path(reference).exists():
        raise Trouble(f"{reference}: there is no such file")
    with tempfile.TemporaryDirectory() as folder:
        now = Path(folder) / Path(reference).name
        dump(library, sources, now)
        found = difference(reference, now)
    if not found:
        return 0
    step, text = found
    print(ADVICE.format(library=library, reference=reference, text=text, step=step, why=WHY[step]),
          file=sys.stderr)
    return 1


def main(arguments):
    if len(arguments) != 4 or arguments[0] not in ("compare", "write"):
        print(__doc__, file=sys.stderr)
        return 2
    task, *files = arguments
    try:
        if task == "compare":
            return compare(*files)
        dump(*files)
        return 0
    except (Trouble, OSError) as trouble:
        print(trouble, file=sys.stderr)
        return 2


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))
