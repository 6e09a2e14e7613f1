"""abi.py, on a small library that is compiled twice: as it is, and with a change."""

import argparse
import subprocess
import sys
import tempfile
import unittest
from pathlib import Path

HERE = Path(__file__).resolve().parent
COMPILER = "g++"

HEADER = """
#pragma once
#include "internal/hidden.h"
#include <foreign.h>
namespace HmiStateMachine {
enum Kind { One, Two, Three };
class __attribute__((visibility("default"))) View
{
public:
    enum Mode { Slow, Fast };
    View();
    virtual ~View();
    void show(Kind kind);
    Mode mode() const;
    int width();
    virtual void entered();
    virtual void left();
    virtual int asked() = 0;
protected:
    void tell();
private:
    void remember();
    int m_width = 0;
    Hidden *m_hidden = nullptr;
    Foreign m_foreign;
    char m_flag = 0;
};
}
"""
# Two sources: what one of them defines must not hide what the other does.
FIRST = """
#include "view.h"
namespace HmiStateMachine {
View::View() {}
void View::show(Kind) { remember(); }
Helper::Helper() {}
}
"""
SECOND = """
#include "view.h"
namespace HmiStateMachine {
View::~View() {}
View::Mode View::mode() const { return Fast; }
int View::width() { return m_width; }
void View::entered() {}
void View::left() {}
void View::tell() {}
void View::remember() {}
}
"""
HIDDEN = """
#pragma once
namespace HmiStateMachine {
struct Hidden { int x; };
struct __attribute__((visibility("default"))) Helper { Helper(); };
}
"""
FOREIGN = """
#pragma once
struct Foreign { int x; enum Type { A, B }; Type type; };
"""
PARTS = {"src/view.h": HEADER, "src/first.cpp": FIRST, "src/second.cpp": SECOND,
         "src/internal/hidden.h": HIDDEN, "foreign/foreign.h": FOREIGN}


class Checker(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.folder = Path(folder.name)
        self.reference = self.folder / "library.abi"

    def build(self, changes):
        for name, text in PARTS.items():
            for old, new in changes:
                text = text.replace(old, new)
            path = self.folder / name
            path.parent.mkdir(parents=True, exist_ok=True)
            path.write_text(text, encoding="utf-8")
        for old, _ in changes:
            self.assertTrue(any(old in text for text in PARTS.values()), old)
        subprocess.run([COMPILER, "-g", "-femit-class-debug-always", "-fPIC", "-shared",
                        "-fvisibility=hidden", "-I", self.folder / "foreign",
                        "-o", self.folder / "library.so",
                        *sorted((self.folder / "src").glob("*.cpp"))], check=True)

    def run_tool(self, task, sources="src"):
        return subprocess.run([sys.executable, "-B", HERE / "abi.py", task, self.folder / "library.so",
                               self.folder / sources, self.reference],
                              text=True, capture_output=True, check=False)

    def compare(self, *changes):
        self.build([])
        self.assertEqual(self.run_tool("write").returncode, 0)
        self.build(changes)
        return self.run_tool("compare")

    def expect(self, step, names, *changes):
        done = self.compare(*changes)
        self.assertIn(f"This asks for a {step} step of the version", done.stderr)
        for name in names:
            self.assertIn(name, done.stderr)
        self.assertIn("--target update-interface", done.stderr)
        self.assertEqual(done.returncode, 1)

    def expect_none(self, *changes):
        done = self.compare(*changes)
        self.assertEqual(done.stderr, "")
        self.assertEqual(done.returncode, 0)


class MajorSteps(Checker):
    def test_virtual_functions_in_another_order(self):
        self.expect("major", ["View::entered()", "vtable offset", "from 2 to 3"],
                    ("virtual void entered();\n    virtual void left();",
                     "virtual void left();\n    virtual void entered();"))

    def test_virtual_function_added(self):
        self.expect("major", ["View::more()"], ("virtual void left();",
                                                "virtual void left();\n    virtual void more() {}"))

    def test_data_member_added(self):
        self.expect("major", ["int m_height", "m_flag", "offset changed"],
                    ("int m_width = 0;", "int m_width = 0; int m_height = 0;"),
                    ("Foreign m_foreign;", "Foreign m_foreign; long m_more = 0;"))

    def test_data_members_in_another_order(self):
        self.expect("major", ["m_foreign"],
                    ("Hidden *m_hidden = nullptr;\n    Foreign m_foreign;",
                     "Foreign m_foreign;\n    Hidden *m_hidden = nullptr;"))

    def test_function_removed(self):
        self.expect("major", ["1 Removed function", "View::width()"],
                    ("int width();", ""), ("int View::width() { return m_width; }", ""))

    def test_protected_function_removed(self):
        self.expect("major", ["View::tell()"], ("void tell();", ""), ("void View::tell() {}", ""))

    def test_parameter_of_another_type(self):
        self.expect("major", ["View::show("], ("show(Kind kind)", "show(long kind)"),
                    ("show(Kind)", "show(long)"))

    def test_result_of_another_type(self):
        self.expect("major", ["View::width()", "return type changed"], ("int width", "long width"),
                    ("int View::width", "long View::width"))

    def test_enumerator_with_another_value(self):
        self.expect("major", ["Kind::Two", "from value '1' to '3'"], ("One, Two", "One, Two = 3"))

    def test_member_enumerators_in_another_order(self):
        self.expect("major", ["Mode::Slow"], ("Slow, Fast", "Fast, Slow"))

    def test_foreign_type_that_grows_within_a_class(self):
        self.expect("major", ["m_flag"], ("struct Foreign { int x;", "struct Foreign { int x; long y;"))


class MinorSteps(Checker):
    def test_function_added(self):
        self.expect("minor", ["1 Added function", "View::height()"],
                    ("int width();", "int width(); int height();"),
                    ("int View::width()", "int View::height() { return 0; }\nint View::width()"))

    def test_enumerator_added_at_the_end(self):
        self.expect("minor", ["Kind::Four"], ("Two, Three", "Two, Three, Four"))


class NoSteps(Checker):
    def test_same_library(self):
        self.expect_none()

    def test_private_function_removed(self):
        self.expect_none(("void remember();", ""), ("void View::remember() {}", ""), ("remember();", ""))

    def test_internal_class_changed(self):
        self.expect_none(("struct Hidden { int x;", "struct Hidden { int x; int y;"))

    def test_internal_function_removed(self):
        self.expect_none(("{ Helper(); }", "{ }"), ("Helper::Helper() {}", ""))

    def test_foreign_type_with_other_names_inside(self):
        self.expect_none(("enum Type { A, B }; Type type;", "enum Sort { C, D, E }; Sort sort;"))


class Troubles(Checker):
    def test_without_a_reference(self):
        self.build([])
        done = self.run_tool("compare")
        self.assertIn("library.abi: there is no such file", done.stderr)
        self.assertEqual(done.returncode, 2)

    def test_without_a_library(self):
        self.reference.write_text("", encoding="utf-8")
        done = self.run_tool("compare")
        self.assertIn("library.so", done.stderr)
        self.assertEqual(done.returncode, 2)

    def test_with_headers_of_something_else(self):
        self.build([])
        done = self.run_tool("write", sources="foreign/more")
        self.assertIn("has no class out of headers in", done.stderr)
        self.assertEqual(done.returncode, 2)

    def test_unknown_task(self):
        done = self.run_tool("guess")
        self.assertIn("abi.py compare LIBRARY SOURCES REFERENCE", done.stderr)
        self.assertEqual(done.returncode, 2)


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--compiler", default=COMPILER)
    known, others = parser.parse_known_args()
    COMPILER = known.compiler
    unittest.main(argv=[sys.argv[0], *others])
