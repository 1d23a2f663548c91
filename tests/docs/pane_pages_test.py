#!/usr/bin/env python3
"""The pages of the panes are as they are made, there is one for each type of item, and the headers are read as meant."""
import os
import re
import sys
import unittest
import xml.etree.ElementTree as ElementTree

sys.dont_write_bytecode = True
DOCS = os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "..", "docs")
sys.path.insert(0, DOCS)
import make_pane_pages  # noqa: E402
from header_reader import read_class  # noqa: E402

# What other panes are made of, and what no program makes.
PARTS = {"SearchTextPane", "ZoomPopUpControl"}
SCHEMA = "{http://www.w3.org/2001/XMLSchema}"


def item_types():
    root = ElementTree.parse(os.path.join(DOCS, "glog.xsd")).getroot()
    types = root.find(f"{SCHEMA}simpleType[@name='StockItemType']")
    return {value.get("value") for value in types.iter(SCHEMA + "enumeration")}


def page_elements():
    return list(ElementTree.parse(os.path.join(DOCS, "panes", "pages.xml")).getroot())


def is_public_pane(name, path, headers):
    if path.startswith("dialogs/"):
        return False
    try:
        return make_pane_pages.is_pane(name, headers)
    except ValueError:  # a header without a class of its name
        return False


def read(body, name="Meter", base=""):
    return read_class(f"// Shows a level.\n\nclass {name}{base} {{\n{body}\n}};".splitlines(), name, name + ".h")


def told(body):
    return [(group.declarations, group.comment) for group in read("public:\n" + body).operations]


class PagesTest(unittest.TestCase):
    def test_the_pages_are_as_they_are_made(self):
        self.assertEqual(make_pane_pages.wrong_pages(make_pane_pages.made(), make_pane_pages.kept()), [])

    def test_pages_that_differ_that_are_missing_and_that_are_too_many_are_wrong(self):
        self.assertEqual(make_pane_pages.wrong_pages({"a": "1", "b": "1", "c": "1"}, {"a": "1", "b": "2", "d": "1"}),
                         ["b", "c", "d"])

    def test_there_is_a_page_for_each_type_of_item(self):
        pages = page_elements()
        self.assertGreater(len(item_types()), 40)
        self.assertEqual(item_types() - {page.get("item") for page in pages}, set())

    def test_every_page_shows_its_item(self):
        for name in item_types():
            self.assertIn(f'<Item type="{name}"', make_pane_pages.kept()[name + ".md"])

    def test_every_page_says_what_mouse_and_keys_do(self):
        for name, page in make_pane_pages.kept().items():
            if name != "README.md":
                self.assertTrue(re.search(r"\n## Mouse and keyboard\n\n[A-Z]", page), name)

    def test_every_page_has_two_pictures_and_there_are_no_others(self):
        names = {page.get("item") or page.get("class") for page in page_elements()}
        self.assertEqual({f"{name}-{theme}.png" for name in names for theme in ("light", "dark")},
                         set(os.listdir(os.path.join(DOCS, "panes", "images"))))

    def test_there_is_a_page_for_each_class_of_panes_but_for_bases_and_parts(self):
        headers = make_pane_pages.Headers(make_pane_pages.TREE, [*make_pane_pages.FOLDERS])
        pages = {page.get("class") for page in page_elements()}
        told = set()
        for element in page_elements():
            if element.get("class"):
                told |= {one.name for one in make_pane_pages.Page(element, headers, None).classes()}
        panes = {name for name, path in headers.paths.items() if is_public_pane(name, path, headers)}
        self.assertEqual(panes - told, PARTS)
        self.assertGreater(len(pages & panes), 40)

    def test_every_example_and_script_belongs_to_a_page(self):
        names = {os.path.splitext(file)[0] for file in os.listdir(os.path.join(DOCS, "panes", "dialogs"))}
        self.assertEqual(names - item_types(), set())

    def test_every_type_of_item_has_one_or_two_sentences_about_what_it_is_for(self):
        reference = make_pane_pages.Reference(make_pane_pages.file_text(DOCS, "dialog-reference.md"))
        for name in item_types():
            purpose = reference.section(name).paragraphs[0]
            self.assertIn(len(re.findall(r"[.!?](?= [A-Z]|$)", purpose)), (1, 2), f"{name}: {purpose}")


class MessagesTest(unittest.TestCase):
    TOLD = re.compile(r"[Ww]atchers of messages hear(.*?)(?=\.\s|\.$|;)", re.DOTALL)

    def sent(self):
        names = set()
        for name in os.listdir(os.path.join(DOCS, "..", "dialogs")):
            if name.endswith(".cpp"):
                text = make_pane_pages.file_text(DOCS, "..", "dialogs", name)
                names |= set(re.findall(r'"message", std::string\("(\w+)"\)', text))
                names |= set(re.findall(r'\b(?:Report\(\*?pane, |Begin\()"(\w+)"\)', text))
        return names

    def test_the_reference_tells_of_every_message_that_watchers_hear_and_of_no_other(self):
        reference = make_pane_pages.file_text(DOCS, "dialog-reference.md")
        told = {name for text in self.TOLD.findall(reference) for name in re.findall(r"`(\w+)`", text)}
        self.assertEqual(told - {"PopUpMenu", "Up", "Down"}, self.sent())


class HeaderTest(unittest.TestCase):
    def test_a_comment_is_told_with_all_declarations_below_it(self):
        self.assertEqual(told("    // Both.\n    void A();\n    int B() const;\n\n    void C();"),
                         [(["void A()", "int B() const"], "Both."), (["void C()"], "")])

    def test_a_comment_at_the_end_of_a_line_is_about_that_line(self):
        self.assertEqual(told("    // Above.\n    void A();\n    void B(); // Ends, and\n              // goes on.\n"),
                         [(["void A()"], "Above."), (["void B()"], "Ends, and goes on.")])

    def test_bodies_and_initialisers_are_left_out(self):
        self.assertEqual(told("    // A.\n    explicit Meter(int l)\n        : level(l) {}\n"
                              "    int B() const { return level; } // B.\n\n    virtual void C() = 0;"),
                         [(["Meter(int l)"], "A."), (["int B() const"], "B."), (["void C()"], "")])

    def test_overrides_fields_and_what_is_not_public_are_no_operations(self):
        meter = read("public:\n    void A() override;\n    short b; // Pixels.\nprotected:\n    void C();\n"
                     "private:\n    void D();")
        self.assertEqual(meter.operations, [])
        self.assertEqual([(field.declarations, field.comment) for field in meter.fields], [(["short b"], "Pixels.")])

    def test_a_declaration_may_take_several_lines(self):
        self.assertEqual(told("    // A.\n    void A(int one,\n           int two);"),
                         [(["void A(int one, int two)"], "A.")])

    def test_a_comment_with_a_blank_line_below_it_is_a_heading(self):
        group = read("public:\n    // Rows\n\n    // A.\n    void A();").operations[0]
        self.assertEqual((group.heading, group.comment), ("Rows", "A."))

    def test_bases_are_told_with_the_listeners_that_they_provide_for(self):
        self.assertEqual(read("", base=" : public Provider<MeterListener>,\n              public GlogPane").bases,
                         ["Provider<MeterListener>", "GlogPane"])

    def test_classes_inside_a_class_are_told_by_themselves(self):
        meter = read("public:\n    // Listens.\n    class Client {\n    public:\n        // Moved.\n"
                     "        virtual void Move();\n    };\n    // A.\n    void A();")
        self.assertEqual([(inner.name, inner.about) for inner in meter.inner], [("Meter::Client", ["Listens."])])
        self.assertEqual(meter.inner[0].operations[0].comment, "Moved.")
        self.assertEqual(meter.operations[0].comment, "A.")


if __name__ == "__main__":
    unittest.main()
