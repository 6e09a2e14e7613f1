"""The schemas of the rules and of the inventory: what they take, what they object to, and where."""

import json
import re
import sys
import unittest
from pathlib import Path

try:
    from jsonschema import Draft202012Validator
except ImportError as error:
    sys.exit(f"{error}. Debian's package python3-jsonschema is needed.")

HERE = Path(__file__).resolve().parent
PROJECT = HERE.parents[2]
SCHEMAS = PROJECT / "tools" / "hmi-rules" / "schema"
PAGE = PROJECT / "docs" / "popup-rules.md"
LIBRARY_SAMPLES = PROJECT / "tests" / "data" / "interruptions"


def read(path):
    return json.loads(path.read_text(encoding="utf-8"))


def validator(name):
    schema = read(SCHEMAS / name)
    Draft202012Validator.check_schema(schema)
    return Draft202012Validator(schema)


def errors(schema, instance):
    """A line for each error: where it is, and the keyword of the schema that it breaks."""
    return sorted(f"{error.json_path} {error.validator}" for error in schema.iter_errors(instance))


def samples(folder):
    """The files of a folder; an empty folder is a mistake, not a success."""
    found = sorted(folder.glob("*.json"))
    if not found:
        raise FileNotFoundError(f"no samples in {folder}")
    return found


def expected(sample):
    return sorted(sample.with_suffix(".expected").read_text(encoding="utf-8").splitlines())


def subschemas(schema):
    if isinstance(schema, dict):
        yield schema
    if isinstance(schema, (dict, list)):
        for child in schema.values() if isinstance(schema, dict) else schema:
            yield from subschemas(child)


class SchemaTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.rules = validator("popup-interruptions.schema.json")
        cls.inventory = validator("inventory.schema.json")

    def check_valid(self, schema, paths):
        for path in paths:
            with self.subTest(path.stem):
                self.assertEqual(errors(schema, read(path)), [])

    def check_invalid(self, schema, folder):
        for path in samples(folder):
            with self.subTest(path.stem):
                self.assertTrue(expected(path))
                self.assertEqual(errors(schema, read(path)), expected(path))

    def test_valid_rules_have_no_error(self):
        self.check_valid(self.rules, samples(HERE / "valid"))

    def test_each_invalid_rule_is_objected_to_where_it_stands(self):
        self.check_invalid(self.rules, HERE / "invalid")

    def test_valid_inventories_have_no_error(self):
        self.check_valid(self.inventory, samples(HERE / "inventory" / "valid"))

    def test_each_invalid_inventory_is_objected_to_where_it_is_wrong(self):
        self.check_invalid(self.inventory, HERE / "inventory" / "invalid")

    def test_the_rules_of_the_head_unit_have_no_error(self):
        self.check_valid(self.rules, [PROJECT / "examples" / "headunit" / "interruptions.json"])

    def test_what_the_library_warns_of_is_an_error(self):
        judged = 0
        for path in samples(LIBRARY_SAMPLES):
            warnings = path.with_suffix(".expected").read_text(encoding="utf-8")
            if warnings and "parse error" not in warnings:
                judged += 1
                with self.subTest(path.stem):
                    self.assertFalse(self.rules.is_valid(read(path)))
        self.assertGreater(judged, 0)

    def test_editors_offer_the_four_behaviours_as_the_library_writes_them(self):
        choices = self.rules.schema["$defs"]["behavior"]["anyOf"]
        offered = [choice["const"] for choice in choices if "const" in choice]
        self.assertEqual(offered, ["Prohibit", "Allow", "AllowStack", "AllowNoReturn"])

    def test_the_page_on_rules_shows_nothing_invalid(self):
        # The findings behind it show what is wrong.
        text, _, _ = PAGE.read_text(encoding="utf-8").partition("<!-- findings -->")
        blocks = re.findall(r"^```json\n(.*?)^```$", text, re.M | re.S)
        found = {list: 0, dict: 0}
        for block in map(json.loads, blocks):
            found[type(block)] += 1
            with self.subTest(json.dumps(block)):
                schema = self.rules if isinstance(block, list) else self.inventory
                self.assertEqual(errors(schema, block), [])
        self.assertTrue(all(found.values()), found)

    def test_what_the_schemas_show_as_examples_and_defaults_is_valid(self):
        for schema in (self.rules, self.inventory):
            for part in subschemas(schema.schema):
                shown = list(part.get("examples", []))
                if not isinstance(part.get("default", {}), dict): # a schema: the key "default"
                    shown.append(part["default"])
                for value in shown:
                    with self.subTest(value=value):
                        self.assertEqual(errors(schema.evolve(schema=part), value), [])


if __name__ == "__main__":
    unittest.main()
