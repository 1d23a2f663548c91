#!/usr/bin/env python3
"""Writes into glog.xsd what dialog-reference.md tells of each key, for editors to show.

    make_schema_notes.py [--check]

Elements and attributes that the reference has no line for keep the notes that they have. With --check nothing is
written: if the schema is not as it would be made, the status is 1.
"""
import os
import re
import sys
import xml.etree.ElementTree as ElementTree
from xml.sax.saxutils import escape

sys.dont_write_bytecode = True
DOCS = os.path.dirname(os.path.abspath(__file__))
SCHEMA = "{http://www.w3.org/2001/XMLSchema}"
EVERY_ITEM = "Every item"
WINDOW = "Glog"
# In the schema one element is the items of a group and the tabs of a row; the reference has no line for the former.
WITH_NOTES_OF_THEIR_OWN = {"Items"}


def file_text(name):
    with open(os.path.join(DOCS, name), encoding="utf-8") as file:
        return file.read()


class Line:
    """What the reference tells of a key."""

    def __init__(self, section, cells):
        self.section = section
        self.path = cells[0].strip("`")
        self.value, self.left_out, self.meaning = cells[1:]

    def told(self):
        meaning = re.sub(r"see (Fonts|Icon families|Pictures) below", r"see \1 in the dialog reference", self.meaning)
        end = "Required." if self.left_out == "required" else f"Left out: {self.left_out}."
        return f"{meaning}. {end}".replace("`", "")


def lines_of(reference):
    """The lines of the tables of keys, by item type and path."""
    found = {}
    for section, text in re.findall(r"^## ([^\n]+)\n(.*?)(?=^## |\Z)", reference, re.MULTILINE | re.DOTALL):
        for row in re.findall(r"^\|.*$", text, re.MULTILINE)[2:]:
            cells = [cell.strip() for cell in re.split(r"(?<!\\)\|", row.strip("|"))]
            if len(cells) == 4:
                line = Line(section, cells)
                found[section, line.path] = line
    return found


class Schema:
    """The elements and attributes of the schema, and where in an item they may stand."""

    def __init__(self, text):
        self.root = ElementTree.fromstring(text)
        self.types = {one.get("name"): one for kind in ("complexType", "simpleType")
                      for one in self.root.findall(SCHEMA + kind)}
        self.nodes = [node for node in self.root.iter() if node.tag in (SCHEMA + "element", SCHEMA + "attribute")]
        self.paths = {}  # of each node, in the order in which they are met

    def walk(self, type_name, path, known):
        for node in self.types[type_name].iter() if type_name in self.types else []:
            if node.tag in (SCHEMA + "element", SCHEMA + "attribute"):
                self.walk_key(node, path, known)

    def walk_key(self, node, path, known):
        own = path + node.get("name")
        paths = self.paths.setdefault(node, [])
        if own in known and own not in paths:
            paths.append(own)
            self.walk(node.get("type"), own + "/", known)


def walked(schema_text, lines):
    """The schema with the places of its keys."""
    schema = Schema(schema_text)
    known = {path for section, path in lines if section != WINDOW}
    for group in schema.root.findall(SCHEMA + "group"):
        for node in group.iter(SCHEMA + "element"):
            schema.walk_key(node, "", known)
    return schema


def note(lines):
    """What is told of one element by the lines that are about it; the same is told once."""
    same = {}
    for line in lines:
        same.setdefault(line.told(), []).append(line)
    for_all = all(line.section == EVERY_ITEM for line in lines)
    if len(same) == 1 and (for_all or "/" in lines[0].path):
        return sentence(next(iter(same)))
    by_type = len(same) == 1 or len({frozenset(line.section for line in alike) for alike in same.values()}) > 1
    return " ".join(f"{label(alike, by_type)}: {text}" for text, alike in same.items())


def sentence(text):
    """With a capital, where it does not begin with one of the key's words."""
    return text if re.match(r"\w+:", text) else text[0].upper() + text[1:]


def label(alike, by_type):
    """Which lines are meant, by the types of items or by the elements around the key."""
    return ", ".join(dict.fromkeys(line.section if by_type else line.path.split("/")[-2] for line in alike))


def notes(schema_text, lines):
    """A note for each element and attribute of the schema, None for those that keep their own."""
    schema = walked(schema_text, lines)
    window = set(schema.types["Glog"].findall(SCHEMA + "attribute"))
    found = []
    for node in schema.nodes:
        about = [line for path in schema.paths.get(node, []) for (section, own), line in lines.items()
                 if own == path and section != WINDOW]
        if node in window:
            found.append(sentence(lines[WINDOW, node.get("name")].told()))
        else:
            found.append(note(about) if about and node.get("name") not in WITH_NOTES_OF_THEIR_OWN else None)
    return found


NODE = re.compile(r"""^(?P<indent>[ ]*)<xs:(?P<kind>element|attribute)(?P<attributes>[ ][^<>]*?)
                      (?P<end>/>|>\n[ ]*<xs:annotation>.*?</xs:annotation>(?P<rest>\n[ ]*</xs:(?:element|attribute)>)?|>)
                      $""", re.MULTILINE | re.VERBOSE | re.DOTALL)


def with_note(match, text):
    indent, kind, attributes = match.group("indent"), match.group("kind"), match.group("attributes")
    own = f"{indent}  <xs:annotation><xs:documentation>{escape(text)}</xs:documentation></xs:annotation>"
    opened = f"{indent}<xs:{kind}{attributes}>\n{own}"
    holds_more = match.group("end").startswith(">") and not match.group("rest")
    return opened if holds_more else f"{opened}\n{indent}</xs:{kind}>"


def made(schema_text, reference):
    """The schema with the notes that the reference makes."""
    waiting = iter(notes(schema_text, lines_of(reference)))

    def replaced(match):
        text = next(waiting)
        return with_note(match, text) if text else match.group(0)

    text = NODE.sub(replaced, schema_text)
    if next(waiting, "none") != "none":
        raise ValueError("glog.xsd has an element or attribute that does not begin a line")
    return text


def main(arguments):
    standing = file_text("glog.xsd")
    text = made(standing, file_text("dialog-reference.md"))
    if arguments == ["--check"]:
        if text != standing:
            print("docs/glog.xsd is not as docs/make_schema_notes.py makes it")
        return int(text != standing)
    if text != standing:
        with open(os.path.join(DOCS, "glog.xsd"), "w", encoding="utf-8") as file:
            file.write(text)
    return 0


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))
