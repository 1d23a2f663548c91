#!/usr/bin/env python3
"""The schema says of each key what the dialog reference says, knows the same keys, and takes the same numbers."""
import os
import re
import sys
import unittest

sys.dont_write_bytecode = True
sys.path.insert(0, os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "..", "docs"))
import make_schema_notes as notes  # noqa: E402

REFERENCE = notes.file_text("dialog-reference.md")
SCHEMA = notes.file_text("glog.xsd")
LINES = notes.lines_of(REFERENCE)
# Attributes of every text and number, of every rectangle and of every point.
OF_VALUES = {"list", "index", "type", "top", "left", "bottom", "right", "v", "h"}
BUILT_IN = {"xs:integer": (float("-inf"), float("inf")), "xs:int": (-2**31, 2**31 - 1), "xs:unsignedShort": (0, 65535),
            "xs:string": None, "xs:token": None}
TABLE = "| Key | Value | Left out | Meaning |\n|---|---|---|---|\n"


def numbers(value):
    """The limits that the reference names for a number; None for other values."""
    if value == "0 or 1":
        return 0, 1
    if match := re.fullmatch(r"integer, (-?\d+) to (-?\d+)", value):
        return int(match.group(1)), int(match.group(2))
    return (-32768, 32767) if value == "integer" else None


def limits(type_name, types):
    """The least and greatest number that a type of the schema takes; None where it takes none."""
    if type_name in BUILT_IN:
        return BUILT_IN[type_name]
    for step in types[type_name].iter():
        if step.tag == notes.SCHEMA + "union":
            return next(filter(None, (limits(member, types) for member in step.get("memberTypes").split())), None)
        if step.tag in (notes.SCHEMA + "extension", notes.SCHEMA + "restriction"):
            known = limits(step.get("base"), types)
            ends = [step.find(notes.SCHEMA + name) for name in ("minInclusive", "maxInclusive")]
            return known and tuple(int(end.get("value")) if end is not None else old for end, old in zip(ends, known))
    return None


def schema_of(keys):
    return ('<xs:schema xmlns:xs="http://www.w3.org/2001/XMLSchema">\n  <xs:group name="Keys">\n' + keys +
            '\n  </xs:group>\n  <xs:complexType name="Glog">\n  </xs:complexType>\n</xs:schema>\n')


class SchemaTest(unittest.TestCase):
    def setUp(self):
        self.schema = notes.walked(SCHEMA, LINES)

    def test_its_notes_are_as_they_are_made(self):
        self.assertEqual(notes.made(SCHEMA, REFERENCE).split("\n"), SCHEMA.split("\n"))

    def test_it_has_every_key_of_the_reference_where_the_reference_has_it(self):
        walked = {path for paths in self.schema.paths.values() for path in paths}
        told = {path for section, path in LINES if section != notes.WINDOW}
        self.assertGreater(len(told), 200)
        self.assertEqual(told - walked, set())

    def test_it_has_no_other_keys_there(self):
        others = {node.get("name") for node, paths in self.schema.paths.items() if not paths}
        self.assertEqual(others - OF_VALUES - {"Item"}, set())

    def test_it_takes_the_numbers_that_some_item_takes_and_no_others(self):
        checked = 0
        for node, paths in self.schema.paths.items():
            told = [numbers(line.value) for (section, path), line in LINES.items()
                    if path in paths and section != notes.WINDOW]
            told = list(filter(None, told))
            if told:
                with_all = (min(least for least, most in told), max(most for least, most in told))
                self.assertEqual(limits(node.get("type"), self.schema.types), with_all, paths)
                checked += 1
        self.assertGreater(checked, 80)

    def test_attributes_are_required_where_the_reference_says_so(self):
        for node, paths in self.schema.paths.items():
            if node.tag == notes.SCHEMA + "attribute" and paths:
                told = {line.left_out == "required" for (section, path), line in LINES.items()
                        if path in paths and section != notes.WINDOW}
                self.assertEqual({node.get("use") == "required"}, told, paths)


class NotesTest(unittest.TestCase):
    def made(self, keys, reference):
        return re.findall(r"<xs:documentation>(.*?)</xs:documentation>", notes.made(schema_of(keys), reference))

    def test_a_key_of_several_types_names_them_by_what_it_means_in_each(self):
        reference = "".join(f"## {name}\n\n{TABLE}| `Mode` | 0 or 1 | 0 | {meaning} |\n\n"
                            for name, meaning in (("A", "1: off"), ("B", "1: off"), ("C", "how")))
        self.assertEqual(self.made('    <xs:element name="Mode" type="Flag"/>', reference),
                         ["A, B: 1: off. Left out: 0. C: how. Left out: 0."])

    def test_a_note_that_stands_already_is_replaced(self):
        once = notes.made(schema_of('    <xs:element name="Mode" type="Flag"/>'),
                          f"## A\n\n{TABLE}| `Mode` | 0 or 1 | required | on |\n")
        again = notes.made(once, f"## A\n\n{TABLE}| `Mode` | 0 or 1 | 1 | off <now> |\n")
        self.assertEqual(re.findall(r"<xs:documentation>(.*?)<", again), ["A: off &lt;now&gt;. Left out: 1."])

    def test_an_element_without_a_line_keeps_its_own(self):
        own = ('    <xs:element name="Other" type="Flag">\n      <xs:annotation><xs:documentation>Own.'
               '</xs:documentation></xs:annotation>\n    </xs:element>')
        self.assertEqual(self.made(own, ""), ["Own."])


if __name__ == "__main__":
    unittest.main()
