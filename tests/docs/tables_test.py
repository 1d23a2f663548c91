#!/usr/bin/env python3
"""Tables of the guide and of the dialog reference name what sources and artwork know, and nothing else."""
import os
import re
import unittest
import xml.etree.ElementTree as ElementTree

TREE = os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "..")


def text_of(path):
    with open(os.path.join(TREE, path), encoding="utf-8") as file:
        return file.read()


def rows(document, chapter):
    """The cells of the rows in a chapter's table."""
    text = re.search(rf"^## {chapter}\n(.*?)(?=^## |\Z)", text_of(document), re.MULTILINE | re.DOTALL).group(1)
    return [[cell.strip() for cell in row.strip("|").split("|")]
            for row in re.findall(r"^\|.*$", text, re.MULTILINE)[2:]]


def guide_rows(chapter):
    return rows("docs/guide.md", chapter)


def reference_rows(chapter):
    return rows("docs/dialog-reference.md", chapter)


def artwork(path):
    return ElementTree.fromstring(text_of("artwork/" + path))


def table_of(source, name):
    """The first strings of the entries of a table in a source."""
    body = re.search(rf"\b{name}\[\] = \{{(.*?)\}};", text_of(source), re.DOTALL).group(1)
    return set(re.findall(r'\{"([^"]+)"', body))


class GuideTest(unittest.TestCase):
    def test_tells_of_every_step(self):
        told = {words.split()[0] for cells in guide_rows("Scripts") for words in re.findall(r"`([^`]+)`", cells[0])}
        self.assertEqual(told, table_of("desktop/windows/EventScript.cpp", "kStepForms"))

    def test_tells_of_every_key(self):
        row = next(cells for cells in guide_rows("Scripts") if "`key NAME`" in cells[0])
        told = set(re.findall(r"`([^`]+)`", row[1]))
        self.assertEqual(told, table_of("desktop/windows/EventScript.cpp", "kNamedKeys") | {"F1", "F12"})

    def test_tells_of_every_option(self):
        told = {words.split()[0] for cells in guide_rows("glogview") for words in re.findall(r"`([^`]+)`", cells[0])}
        known = re.findall(r'add_(?:option|flag)\("(--\w+)"', text_of("tools/glogview/CommandLine.cpp"))
        self.assertGreater(len(known), 5)
        self.assertEqual(told, set(known))


class ReferenceTest(unittest.TestCase):
    def test_tells_of_every_font(self):
        for cells, font in zip(reference_rows("Fonts"), artwork("fonts.xml").iter("font"), strict=True):
            style = "" if font.get("style") == "plain" else " " + font.get("style")
            self.assertEqual(cells[:2], [font.get("index"), f"{font.get('family')} {font.get('size')}{style}"])

    def test_tells_of_every_icon_family(self):
        told = {cells[0].strip("`") for cells in reference_rows("Icon families")}
        self.assertEqual(told, {family.get("name") for family in artwork("iconsets.xml")})

    def test_tells_of_every_picture_and_its_size(self):
        told = {cells[0].strip("`"): cells[1] for cells in reference_rows("Pictures")}
        self.assertEqual(told.keys(), {picture.get("name") for picture in artwork("pictures.xml")})
        for picture in artwork("pictures.xml"):
            size = artwork(f"pictures/{picture.get('number')}.svg").get("data-size").replace(" ", " by ")
            self.assertTrue(told[picture.get("name")].endswith(size), f"{picture.get('name')} is {size}")


if __name__ == "__main__":
    unittest.main()
