"""Fills the parts of the page into its frame, as the tool does."""

import json
from pathlib import Path

STYLE = ("matrix.css", "grid.css")
SCRIPT = ("model.js", "grid.js", "matrix.js")  # in the order in which they build on each other


def join(folder, names):
    return "\n".join((folder / name).read_text(encoding="utf-8") for name in names)


def assemble(folder, matrix):
    """The text of a page that shows a matrix; `folder` holds the parts."""
    folder = Path(folder)
    page = (folder / "matrix.html").read_text(encoding="utf-8")
    # The data come last: a name in them that looks like a placeholder is left alone.
    for placeholder, text in (
        ("@MATRIX_STYLE@", join(folder, STYLE)),
        ("@MATRIX_SCRIPT@", join(folder, SCRIPT)),
        ("@MATRIX_DATA@", json.dumps(matrix).replace("<", "\\u003c")),
    ):
        assert page.count(placeholder) == 1, placeholder
        page = page.replace(placeholder, text)
    return page
