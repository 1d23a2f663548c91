#!/usr/bin/env python3
"""What the filter makes of the habits of the headers."""
import os
import sys
import unittest

sys.dont_write_bytecode = True
sys.path.insert(0, os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "..", "docs"))
from doxygen_filter import filtered  # noqa: E402


def read(text, name="Meter.h"):
    return filtered(text.splitlines(), name)


class FilterTest(unittest.TestCase):
    def test_the_comment_at_the_top_is_about_the_file_and_its_class(self):
        self.assertEqual(read("// Shows a level.\n#pragma once\nclass Meter {\n};"),
                         ["/// \\file", "/// Shows a level.", "#pragma once", "/// Shows a level.", "class Meter {",
                          "};"])

    def test_a_class_with_a_comment_of_its_own_keeps_to_that(self):
        self.assertEqual(read("// File.\n#pragma once\n// Class.\nclass Meter {\n};")[-3:],
                         ["/// Class.", "class Meter {", "};"])

    def test_a_forward_declaration_takes_no_comment(self):
        self.assertEqual(read("// File.\n#pragma once\nclass Meter;")[-1:], ["class Meter;"])

    def test_a_comment_belongs_to_all_declarations_below_it(self):
        self.assertEqual(read("// File.\n\n// Both.\nint a();\nint b();\n\nint c();")[3:],
                         ["/// Both.", "int a();", "/// Both.", "int b();", "", "int c();"])

    def test_a_comment_belongs_to_no_type_further_down(self):
        self.assertEqual(read("// File.\n\n// First.\nint a();\nenum B { c };")[3:],
                         ["/// First.", "int a();", "enum B { c };"])

    def test_a_comment_of_a_type_belongs_to_types_further_down(self):
        self.assertEqual(read("// File.\n\n// Both.\nenum A { b };\nenum C { d };")[3:],
                         ["/// Both.", "enum A { b };", "/// Both.", "enum C { d };"])

    def test_a_comment_where_a_type_begins_is_about_the_type(self):
        self.assertEqual(read("// File.\n\nstruct A { // A pair.\n    int b;\n};")[3:],
                         ["/// A pair.", "struct A {", "    int b;", "};"])

    def test_a_comment_with_a_blank_line_below_belongs_to_nothing(self):
        self.assertEqual(read("// File.\n\n// Colours.\n\nint a();")[3:], ["", "int a();"])

    def test_a_declaration_on_two_lines_is_one(self):
        self.assertEqual(read("// File.\n\n// Both.\nint a(int,\n      int);\nint b();")[3:],
                         ["/// Both.", "int a(int,", "      int);", "/// Both.", "int b();"])

    def test_a_comment_at_the_end_belongs_to_what_stands_before(self):
        self.assertEqual(read("// File.\n\nint a(); // Ends.")[3:], ["int a(); ///< Ends."])

    def test_a_comment_at_the_end_goes_on_in_its_column(self):
        self.assertEqual(read("// File.\n\nint a(); // Goes\n         // on.")[3:],
                         ["int a(); ///< Goes", "         ///< on."])

    def test_a_comment_after_a_closing_brace_belongs_to_nothing(self):
        self.assertEqual(read("// File.\n\nnamespace a {\n} // namespace a")[3:], ["namespace a {", "}"])

    def test_slashes_in_a_string_are_no_comment(self):
        self.assertEqual(read('// File.\n\nauto a = "http://b";')[3:], ['auto a = "http://b";'])

    def test_bodies_of_functions_stay_as_they_are(self):
        body = ["inline int a() {", "    // Inside.", "    return 1; // too", "}"]
        self.assertEqual(read("// File.\n\n" + "\n".join(body))[3:], body)

    def test_several_names_in_one_declaration_share_its_comment(self):
        self.assertEqual(read("// File.\n\n// Place.\nshort v, h;")[3:],
                         ["/// Place.", "short v;", "/// Place.", "short h;"])

    def test_a_constructor_without_comment_is_told_by_its_class(self):
        self.assertEqual(read("// File.\n\n// Level.\nclass Level {\npublic:\n    explicit Level(int value)\n"
                              "        : v(value) {}\n    int V();\n};")[5:],
                         ["public:", "/// See the class.", "    explicit Level(int value)", "        : v(value) {}",
                          "    int V();", "};"])

    def test_what_doxygen_would_take_for_commands_is_made_plain(self):
        self.assertEqual(read("// File.\n\n// <Item> & `<raw>`\nint a();")[3:],
                         ["/// \\<Item\\> \\& `<raw>`", "int a();"])


if __name__ == "__main__":
    unittest.main()
