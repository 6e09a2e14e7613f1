#!/usr/bin/env python3
"""Checks the pages that Doxygen has written to the folder named: nothing is missing, no link is broken."""

import html.parser
import pathlib
import re
import sys
import unittest
import xml.etree.ElementTree
from urllib.parse import unquote

ROOT = pathlib.Path(__file__).resolve().parents[2]
FOLDERS = {
    "named": ROOT / "src/HmiStateMachine/named",
    "hmi": ROOT / "src/HmiStateMachine/hmi",
    "popup": ROOT / "src/HmiStateMachine/popup",
    "quick": ROOT / "src/HmiStateMachineQuick",
}
CLASS = re.compile(r"^(?:template <.*> )?(class|struct) (?:\w+_EXPORT )?(\w+)[^;]*$", re.MULTILINE)
QT = "https://doc.qt.io/qt-5/"
output = pathlib.Path()


def classes(folder):
    """Pairs of "class" or "struct" and a name, as the headers of a folder define them."""
    texts = (header.read_text(encoding="utf-8") for header in sorted(folder.glob("*.h")))
    return [found for text in texts for found in CLASS.findall(text)]


def page_name(kind, name):
    return f"{kind}HmiStateMachine_1_1{name}.html"


def page(name):
    return (output / "html" / name).read_text(encoding="utf-8")


class Links(html.parser.HTMLParser):
    def __init__(self, text):
        super().__init__()
        self.anchors = set()
        self.targets = []
        self.feed(text)

    def handle_starttag(self, tag, attributes):
        values = dict(attributes)
        self.anchors.update(values[key] for key in ("id", "name") if values.get(key))
        self.targets += [values[key] for key in ("href", "src") if values.get(key)]


class Pages(unittest.TestCase):
    def test_each_public_class_has_a_page_in_the_group_of_its_folder(self):
        found = 0
        index = page("annotated.html")
        for group, folder in FOLDERS.items():
            group_page = page(f"group__{group}.html")
            for kind, name in classes(folder):
                found += 1
                with self.subTest(name):
                    self.assertIn(f'href="{page_name(kind, name)}"', index)
                    self.assertIn(f'href="{page_name(kind, name)}"', group_page)
                    self.assertIn("Detailed Description", page(page_name(kind, name)))
        self.assertGreater(found, 55)

    def test_no_internal_class_has_a_page(self):
        folders = (ROOT / "src/HmiStateMachine/internal", ROOT / "src/HmiStateMachineQuick/internal")
        internal = [found for folder in folders for found in classes(folder)]
        self.assertGreater(len(internal), 5)
        for kind, name in internal:
            self.assertFalse((output / "html" / page_name(kind, name)).exists(), name)

    def test_classes_link_to_their_bases_in_qt(self):
        for name, base in (("NamedState", "qstate"), ("StateMachine", "qstatemachine"),
                           ("HmiSignalTransition", "qsignaltransition"), ("SceneHost", "qquickitem"),
                           ("HostedComponent", "qqmlcomponent")):
            self.assertIn(f'href="{QT}{base}.html', page(page_name("class", name)), name)

    def test_signals_slots_and_properties_show_as_such(self):
        text = page(page_name("class", "NamedState"))
        for section, anchor, member in (("Signals", "signals", "nameChanged"),
                                        ("Public Slots", "pub-slots", "setName"),
                                        ("Properties", "properties", "name")):
            rows = text.split(f'<a id="{anchor}" name="{anchor}"></a>', 1)[1].split("</table>")[0]
            self.assertIn(section, rows)
            self.assertRegex(rows, rf">{member}</")

    def test_each_page_of_the_guide_is_there(self):
        guide = sorted((ROOT / "docs").glob("*.md"))
        self.assertGreater(len(guide), 5)
        listed = page("pages.html")
        for source in guide:
            name = "guide_" + source.stem.replace("-", "_").lower() + ".html"
            self.assertIn(f'href="{name}"', listed)
            self.assertTrue((output / "html" / name).exists(), name)

    def test_the_tag_file_names_each_class(self):
        tags = xml.etree.ElementTree.parse(output / "html" / "HmiStateMachine.tag")
        names = {compound.findtext("name") for compound in tags.iter("compound")}
        for folder in FOLDERS.values():
            for _, name in classes(folder):
                self.assertTrue(any(known.split("<")[0].strip() == f"HmiStateMachine::{name}"
                                    for known in names), name)

    def test_nothing_of_the_markup_is_left(self):
        for path in (output / "html").glob("*.html"):
            self.assertNotRegex(path.read_text(encoding="utf-8"),
                                r"[@\\](page|(sub)*section|ref|code|endcode|snippet|p) ", path.name)

    def test_no_link_within_the_pages_is_broken(self):
        pages = {path.name: Links(path.read_text(encoding="utf-8"))
                 for path in (output / "html").glob("*.html")}
        self.assertGreater(len(pages), 150)
        for name, links in pages.items():
            for target in links.targets:
                if re.match(r"[a-z]+:", target):
                    continue
                file_name, _, anchor = unquote(target).partition("#")
                with self.subTest(f"{name}: {target}"):
                    self.assertTrue((output / "html" / (file_name or name)).exists())
                    if anchor and file_name.endswith((".html", "")) and (file_name or name) in pages:
                        self.assertIn(anchor, pages[file_name or name].anchors)


if __name__ == "__main__":
    output = pathlib.Path(sys.argv.pop(1)).resolve()
    unittest.main()
