"""Checks the page of a matrix in a browser: its own pages, or one that the tool has made.

A page of the tool comes with a file of expectations, a JSON array of
{"front": ..., "requested": ..., "text": ..., "tip": [...]}: the letter of a cell, and all lines of
its tooltip.
"""

import argparse
import json
import sys
import unittest

import matrices
from assemble import assemble
from browser import Browser
from measure import LEAST_CONTRAST, SCROLL
from selenium.webdriver import Keys

ARGUMENTS = None  # of the command line
BROWSER = None  # one for all tests, which takes a second to start

ALL_COUNTS = [["Prohibit", 52], ["Allow", 445], ["AllowStack", 162], ["AllowNoReturn", 121],
              ["invalid", 120]]


class PageTest(unittest.TestCase):
    """No page may complain, or ask for anything but itself."""

    def setUp(self):
        self.browser = BROWSER

    def open(self, name, matrix, link=""):
        page = BROWSER.save(name, assemble(ARGUMENTS.parts, matrix))
        BROWSER.open(page, link)

    def tearDown(self):
        self.assertEqual(BROWSER.errors(), [])
        foreign = [address for address in BROWSER.requests()
                   if not address.startswith(("file:", "data:"))]
        self.assertEqual(foreign, [])
        self.assertLessEqual(BROWSER.run("return document.documentElement.scrollWidth"), 1280)


class HeadUnitTest(PageTest):
    def setUp(self):
        super().setUp()
        self.open("headunit", matrices.head_unit())

    def test_a_cell_tells_behavior_reason_and_place(self):
        rows = (
            ("phone/call", "car/door", "S",
             ["phone/call ← car/door: AllowStack", 'rule for "car/*" in the entry "phone/call"',
              "interruptions.json:6:13", "/0/interruptions/0"]),
            ("phone/lost", "(any other)", "N",
             ["phone/lost ← (any other): AllowNoReturn", 'default of the entry "phone/*"',
              "interruptions.json:14:13", "/1/default"]),
            ("media/*", "car/fuel", "·",
             ["media/* ← car/fuel: Allow", "neither a rule nor a default: Allow is built in"]),
            ("climate/seat", "phone/call", "!",
             ["climate/seat ← phone/call: invalid", 'default "Alow" of the entry "climate/*"',
              "interruptions.json:30:13", "/3/default"]),
            ("car/*", "system/power", "P",
             ["car/* ← system/power: Prohibit", 'rule for "system/*" in the entry "car/*"',
              "interruptions.json:20:13", "/2/interruptions/0"]),
        )
        for front, requested, text, tip in rows:
            with self.subTest(front=front, requested=requested):
                cell = self.browser.cell(front, requested)
                self.assertEqual(cell.text, text)
                self.assertEqual(self.browser.tip_of(cell), tip)

    def test_the_names_of_a_cell_stand_out_while_the_mouse_is_over_it(self):
        self.browser.tip_of(self.browser.cell("car/fuel", "media/lost"))
        self.assertEqual(self.browser.texts(".front.hot"), ["car/fuel"])
        self.assertEqual(self.browser.texts(".requested.hot"), ["media/lost"])

    def test_rule_default_and_built_in_differ_without_colour(self):
        def look(front, requested):
            cell = self.browser.cell(front, requested)
            return self.browser.run("""const style = getComputedStyle(arguments[0]);
                return [style.fontWeight, style.boxShadow !== 'none'];""", cell)

        self.assertEqual(look("phone/call", "media/volume"), ["700", True])
        self.assertEqual(look("car/fuel", "media/volume"), ["400", False])

    def test_filters_leave_what_matches_a_word(self):
        rows = (
            ("PHONE/C", ["phone/call"]),
            ("car/f, lost", ["phone/lost", "car/fuel", "car/fault", "media/lost",
                             "navigation/lost"]),
            ("m*a/*s", ["media/source", "media/lost"]),
            ("lost*phone, media/v*e", ["media/volume"]),
            ("(any", ["(any other)"]),
        )
        for text, names in rows:
            with self.subTest(text=text):
                self.browser.type("front", text)
                self.assertEqual(self.browser.texts(".front"), names)
                self.browser.type("front", "")
                self.browser.type("requested", text)
                self.assertEqual(self.browser.texts(".requested"), names)
                self.browser.type("requested", "")

    def test_no_match_is_told(self):
        self.browser.type("front", "nowhere")
        self.assertTrue(self.browser.find("#empty").is_displayed())
        self.assertEqual(self.browser.texts(".cell"), [])
        self.assertEqual(self.browser.find("#extent").text, "0 × 30 of 30 × 30 cells")

    def test_counts_are_of_what_the_filters_leave(self):
        self.assertEqual(self.browser.counts(), ALL_COUNTS)
        self.browser.type("front", "phone,car")
        self.assertEqual(self.browser.counts(), [
            ["Prohibit", 52], ["Allow", 145], ["AllowStack", 12], ["AllowNoReturn", 121],
            ["invalid", 0]])
        self.assertEqual(self.browser.find("#extent").text, "11 × 30 of 30 × 30 cells")

    def test_highlighting_dims_the_other_behaviors(self):
        self.browser.type("front", "phone/call, car/fuel")
        self.browser.type("requested", "car/door, phone/call, system/voice")
        self.browser.highlight("Prohibit")
        self.browser.highlight("AllowStack")
        self.assertEqual(self.browser.texts(".cell.dim"), ["A"])
        self.browser.highlight("Prohibit")
        self.assertEqual(self.browser.texts(".cell.dim"), ["P", "P", "A", "P"])
        self.assertEqual(self.pressed(), ["AllowStack"])
        self.browser.highlight("AllowStack")
        self.assertEqual(self.browser.texts(".cell.dim"), [])
        self.assertEqual(self.pressed(), [])

    def pressed(self):
        return self.browser.run("""return [...document.querySelectorAll('[aria-pressed="true"]')]
            .map(node => node.querySelector('.label').textContent);""")

    def test_only_rows_and_columns_with_a_highlighted_cell(self):
        self.assertFalse(self.browser.find("#only").is_enabled())
        self.browser.type("front", "car/f, phone/call, media/lost")
        self.browser.highlight("AllowStack")
        self.browser.click(self.browser.find("#only"))
        self.assertEqual(self.browser.texts(".front"), ["phone/call", "car/fuel", "car/fault"])
        self.assertEqual(self.browser.texts(".requested"), [
            "phone/call", "car/fuel", "car/fault", "car/parking", "car/door", "car/tyre", "car/*"])

    def test_a_click_pins_and_escape_unpins(self):
        self.browser.click(self.browser.cell("phone/call", "navigation/advert"))
        for text in ("Prohibit\nThe request is refused.", 'default of the entry "phone/call"',
                     "interruptions.json:4:13", "/0/default",
                     "The other way round\nnavigation/advert ← phone/call: Allow",
                     "Where navigation/advert is blocked\nIn the domains\nPhone\nNavigation",
                     "interruptions.json:40:13", "On the views\nNavigation/Map"):
            self.assertIn(text, self.browser.panel())
        self.browser.press(Keys.ESCAPE)
        self.assertIn("Click a cell", self.browser.panel())
        self.assertNotIn("Prohibit", self.browser.panel())

    def test_the_other_way_round_is_one_click_away(self):
        self.browser.click(self.browser.cell("car/fuel", "phone/call"))
        self.assertIn("is blocked\nNowhere.", self.browser.panel())
        self.browser.click(self.browser.find(".transposed"))
        self.assertTrue(self.browser.panel().startswith(
            "in front\nphone/call\nrequested\ncar/fuel\nS\nAllowStack"), self.browser.panel())
        self.assertEqual(self.browser.active_cell(), ["phone/call", "car/fuel"])

    def test_a_pinned_cell_outlives_filters_that_hide_it(self):
        self.browser.click(self.browser.cell("car/fuel", "phone/call"))
        self.assertNotIn("The filters hide this cell.", self.browser.panel())
        self.browser.type("front", "media")
        self.assertIn("The filters hide this cell.", self.browser.panel())
        self.assertFalse(self.browser.find("#pin-mark").is_displayed())

    def test_keys_move_the_active_cell(self):
        self.browser.run("document.getElementById('grid').focus()")
        rows = (
            ((Keys.ARROW_DOWN, Keys.ARROW_RIGHT, Keys.ARROW_RIGHT), ["phone/ended", "phone/lost"]),
            ((Keys.ARROW_UP, Keys.ARROW_UP, Keys.ARROW_LEFT), ["phone/call", "phone/ended"]),
            ((Keys.END,), ["phone/call", "(any other)"]),
            ((Keys.HOME,), ["phone/call", "phone/call"]),
        )
        for keys, names in rows:
            self.browser.press(*keys)
            self.assertEqual(self.browser.active_cell(), names)
        self.browser.press_with_control(Keys.END)
        self.assertEqual(self.browser.active_cell(), ["(any other)", "(any other)"])
        self.browser.press_with_control(Keys.HOME)
        self.assertEqual(self.browser.active_cell(), ["phone/call", "phone/call"])
        self.browser.press(Keys.PAGE_DOWN)
        self.assertNotEqual(self.browser.active_cell()[0], "phone/call")
        self.browser.press(Keys.PAGE_UP, Keys.ARROW_RIGHT, Keys.ENTER)
        self.assertIn("AllowNoReturn", self.browser.panel())
        self.assertEqual(self.browser.find("#tip .title").text,
                         "phone/call ← phone/ended: AllowNoReturn")
        self.browser.press(Keys.ESCAPE)
        self.assertFalse(self.browser.find("#tip").is_displayed())
        self.assertIn("Click a cell", self.browser.panel())

    def test_a_cell_is_announced_with_its_place_and_behavior(self):
        grid = self.browser.find("#grid")
        cell = self.browser.cell("car/fault", "car/fuel")
        self.assertEqual((grid.get_attribute("aria-rowcount"), grid.get_attribute("aria-colcount")),
                         ("31", "31"))
        self.assertEqual(cell.get_attribute("aria-colindex"), "7")
        self.assertEqual(cell.get_attribute("aria-label"), "Allow, by a default")
        row = self.browser.run("return arguments[0].parentNode", cell)
        self.assertEqual(row.get_attribute("aria-rowindex"), "8")

    def test_a_link_restores_what_was_set(self):
        self.browser.type("front", "phone, car/f")
        self.browser.type("requested", "car/*")
        self.browser.highlight("AllowStack")
        self.browser.click(self.browser.find("#only"))
        self.browser.click(self.browser.cell("phone/call", "car/tyre"))
        panel = self.browser.panel()
        link = self.browser.run("return location.hash")
        self.open("headunit", matrices.head_unit(), link)
        self.assertEqual(self.browser.find("#front").get_property("value"), "phone, car/f")
        self.assertEqual(self.browser.find("#requested").get_property("value"), "car/*")
        self.assertEqual(self.pressed(), ["AllowStack"])
        self.assertTrue(self.browser.find("#only").is_selected())
        self.assertEqual(self.browser.texts(".front"), ["phone/call"])
        self.assertEqual(self.browser.panel(), panel)
        self.browser.run("location.hash = '#front=media/s'")
        self.browser.settle()
        self.assertEqual(self.browser.texts(".front"), ["media/source"])
        self.assertIn("Click a cell", self.browser.panel())

    def test_paper_shows_all_cells(self):
        self.assertLess(len(self.browser.texts(".cell")), 900)
        self.browser.run("dispatchEvent(new Event('beforeprint'))")
        self.assertEqual(len(self.browser.texts(".cell")), 900)
        self.browser.run("dispatchEvent(new Event('afterprint'))")
        self.browser.settle()
        self.assertLess(len(self.browser.texts(".cell")), 900)

    def test_texts_have_contrast_in_light_and_dark(self):
        for scheme in ("light", "dark"):
            self.browser.emulate(scheme)
            self.addCleanup(self.browser.emulate, "light")
            self.browser.highlight("AllowStack")
            self.assertGreaterEqual(self.browser.run(LEAST_CONTRAST), 4.5, scheme)
            self.browser.highlight("AllowStack")
            self.assertGreaterEqual(self.browser.run(LEAST_CONTRAST), 4.5, scheme)


class HostileNamesTest(PageTest):
    def setUp(self):
        super().setUp()
        self.open("hostile", matrices.hostile())

    def test_names_are_shown_as_text(self):
        names = list(matrices.HOSTILE_NAMES)
        self.assertEqual(self.browser.texts(".front"), names)
        self.assertEqual(self.browser.texts(".requested"), names)
        html = names[0]
        self.assertEqual(self.browser.find("#files").text, f"base.json, {html}")
        cell = self.browser.cell(html, html)
        self.assertEqual(self.browser.tip_of(cell), [
            f"{html} ← {html}: Prohibit", f'rule for "{html}"', f"{html}:3:13", f"/0/{html}"])
        self.browser.click(cell)
        self.assertIn(html, self.browser.panel())
        self.assertEqual(self.browser.run("return document.images.length"), 0)
        self.assertIsNone(self.browser.run("return window.hacked"))

    def test_a_long_name_is_cut_off_and_whole_in_its_tooltip(self):
        name = "module/" + "long" * 50
        self.browser.type("front", "module")
        head = self.browser.find(".row:not([hidden]) .front")
        self.assertGreater(self.browser.run("return arguments[0].scrollWidth", head), 230)
        self.assertLessEqual(head.size["width"], 230)
        self.assertEqual(self.browser.tip_of(head), [name])

    def test_links_carry_any_name(self):
        for name in matrices.HOSTILE_NAMES:
            with self.subTest(name=name):
                self.browser.run("document.getElementById('grid').focus()")
                self.browser.press_with_control(Keys.HOME)
                for _ in range(matrices.HOSTILE_NAMES.index(name)):
                    self.browser.press(Keys.ARROW_DOWN)
                self.browser.press(Keys.ENTER)
                link = self.browser.run("return location.hash")
                self.open("hostile", matrices.hostile(), link)
                pinned = self.browser.find("#panel dd").get_property("textContent")
                self.assertEqual(pinned, name)


class LargeTest(PageTest):
    """The nodes depend on the window alone; a row more in sight changes a row of nodes."""

    def scroll(self, size, right, down):
        self.browser.run("document.getElementById('grid').scrollTo(0, 0)")
        result = self.browser.wait(SCROLL, 30, right, down)
        print(f"{size} popups, {right} to the right and {down} down per step: {result}",
              file=sys.stderr)
        return result

    def test_nodes_are_bounded(self):
        nodes = {}
        for size in (300, 2000):
            with self.subTest(size=size):
                self.open(f"large{size}", matrices.large(size))
                lines = self.browser.run("return document.querySelectorAll('.row').length")
                columns = self.browser.run("return document.querySelectorAll('.requested').length")
                down = self.scroll(size, 0, 22)
                self.assertGreater(down["least"], columns)
                self.assertLessEqual(down["most"], columns + 12)
                right = self.scroll(size, 24, 0)
                self.assertGreater(right["least"], lines)
                self.assertLessEqual(right["most"], lines + 12)
                both = self.scroll(size, 97, 61)
                self.assertLess(both["nodes"], 1500)
                self.assertEqual(both["nodes"], down["nodes"])
                nodes[size] = both["nodes"]
        self.assertEqual(nodes[300], nodes[2000])

    def test_the_far_corner_is_shown(self):
        self.open("large2000", matrices.large(2000))
        self.browser.run("document.getElementById('grid').focus()")
        self.browser.press_with_control(Keys.END)
        self.assertEqual(self.browser.active_cell(), ["module166/popup07"] * 2)
        # The popups 1994 and 1995 to 1999 are requested.
        self.assertEqual(self.browser.texts(".cell")[-6:], ["S", "·", "·", "·", "·", "·"])
        self.assertEqual(self.browser.texts(".front")[-1], "module166/popup07")


class GivenPageTest(PageTest):
    """A page that the tool has made, and what its cells are expected to tell."""

    def setUp(self):
        super().setUp()
        self.browser.open(ARGUMENTS.page)

    def test_cells_are_as_expected(self):
        with open(ARGUMENTS.expect, encoding="utf-8") as file:
            expectations = json.load(file)
        self.assertTrue(expectations)
        for expected in expectations:
            front, requested = expected["front"], expected["requested"]
            with self.subTest(front=front, requested=requested):
                cell = self.browser.cell(front, requested)
                self.assertEqual(cell.text, expected["text"])
                self.assertEqual(self.browser.tip_of(cell), expected["tip"])
                self.browser.click(cell)
                self.assertIn(expected["tip"][1], self.browser.panel())


def tests():
    loader = unittest.defaultTestLoader
    classes = (GivenPageTest,) if ARGUMENTS.page else (HeadUnitTest, HostileNamesTest, LargeTest)
    return unittest.TestSuite(loader.loadTestsFromTestCase(each) for each in classes)


def main():
    global ARGUMENTS, BROWSER
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--chromium", required=True)
    parser.add_argument("--chromedriver", required=True)
    parser.add_argument("--parts", help="the folder with the parts of the page")
    parser.add_argument("--page", help="a page that the tool has made, in place of our own")
    parser.add_argument("--expect", help="what the cells of --page tell")
    ARGUMENTS = parser.parse_args()
    if (ARGUMENTS.parts is None) == (ARGUMENTS.page is None) or (
            (ARGUMENTS.page is None) != (ARGUMENTS.expect is None)):
        parser.error("either --parts, or --page and --expect")
    BROWSER = Browser(ARGUMENTS.chromium, ARGUMENTS.chromedriver)
    try:
        result = unittest.TextTestRunner(verbosity=2).run(tests())
    finally:
        BROWSER.close()
    return 0 if result.wasSuccessful() else 1


if __name__ == "__main__":
    sys.exit(main())
