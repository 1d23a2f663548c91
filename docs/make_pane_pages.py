#!/usr/bin/env python3
"""Makes docs/panes/*.md, a page for each pane, from what is told elsewhere.

    make_pane_pages.py [--check]

panes/pages.xml lists the pages. What an item is for and its keys come from dialog-reference.md, how mouse and keyboard
work, the messages, the operations and the fields of records from the headers' comments, the example from
panes/dialogs/. The pictures are made from the same example by the test that compares them. With --check nothing is
written: pages that are not as they would be made are named, and the status is 1.
"""
import os
import re
import sys
import xml.etree.ElementTree as ElementTree

sys.dont_write_bytecode = True
sys.path.insert(0, os.path.dirname(os.path.abspath(__file__)))
from header_reader import Headers  # noqa: E402

DOCS = os.path.dirname(os.path.abspath(__file__))
TREE = os.path.dirname(DOCS)
PANES = os.path.join(DOCS, "panes")
FOLDERS = {"buttons": "Buttons", "text": "Text", "lists": "Lists and selections", "scrolling": "Scrolling",
           "menus": "Menus", "tabs": "Tabs", "graphics": "Graphics", "dialogs": "Layout"}
LISTENERS = "frame"
UP = "../.."                  # from a page to the top of the tree
LONGEST_COMMENT = 240         # of an operation, in the table
LONGEST_HEADING = 40
SMALL_WIDTH = 160             # of pictures in the index; pixels


def file_text(*path):
    with open(os.path.join(*path), encoding="utf-8") as file:
        return file.read()


# Text


def escaped(text):
    """Plain text as Markdown; code in backticks stays."""
    parts = re.split(r"(`[^`]*`)", text)
    return "".join(part if part.startswith("`") else re.sub(r"([*<>|\[\]]|(?<!\w)_|_(?!\w))", r"\\\1", part)
                   for part in parts)


def code(text):
    return "`" + text.replace("|", "\\|") + "`"


def shortened(comment):
    """The whole sentences at the beginning that are not too long together, the first one in any case."""
    kept = ""
    for sentence in re.split(r"(?<=[.]) (?=[A-Z\"])", comment):
        if kept and len(kept) + len(sentence) > LONGEST_COMMENT:
            return kept + " …"
        kept += (" " if kept else "") + sentence
    return kept


def block(language, text):
    return "```" + language + "\n" + text.rstrip("\n") + "\n```"


def link(path):
    return f"[{path}]({UP}/{path})"


# The reference of dialogs


def linked_chapter(match):
    name = match.group(1)
    return f"see [{name}](../dialog-reference.md#{name.lower().replace(' ', '-')})"


class Section:
    """What the reference tells of an item type: paragraphs, and the lines of its table of keys."""

    def __init__(self, text):
        text = re.sub(r"see (Fonts|Icon families|Pictures) below", linked_chapter, text)
        self.paragraphs, self.table = [], []
        for part in re.split(r"\n\n+", text.strip()):
            if part.startswith("|"):
                self.table = part.split("\n")
            elif not part.startswith("```"):
                self.paragraphs.append(" ".join(part.split()))


class Reference:
    def __init__(self, text):
        self.sections = dict(re.findall(r"^## ([^\n]+)\n(.*?)(?=^## |\Z)", text, re.MULTILINE | re.DOTALL))

    def section(self, name):
        return Section(self.sections[name])

    def record(self, item):
        """First number and further fields of the item's binary record; None when it has none."""
        for row in Section(self.sections["Binary dialogs"]).table:
            cells = [cell.strip() for cell in row.strip("|").split("|")]
            if cells[0] == item:
                return cells[1], cells[2]
        return None


# Pages


def is_pane(name, headers):
    if name in ("GlogPane", "CompoundPane"):
        return True
    return headers.has(name) and any(is_pane(base, headers) for base in headers.find(name).bases)


class Page:
    def __init__(self, element, headers, reference):
        self.item = element.get("item")
        self.class_name = element.get("class")
        self.name = self.item or self.class_name
        self.record_name = element.get("record")
        self.also = (element.get("also") or "").split()
        self.behaves_as = (element.get("behavesAs") or "").split()
        self.headers, self.reference = headers, reference
        self.section = reference.section(self.item) if self.item and reference else None
        self.golden_width = element.get("width")  # of the part of a golden picture

    def classes(self):
        """The class, its bases that are panes of the library, and what else belongs to it."""
        found = []
        waiting = ([self.class_name] if self.class_name else []) + self.also
        while waiting:
            name = waiting.pop(0)
            if name in found or not self.headers.has(name):
                continue
            found.append(name)
            waiting += [base for base in self.headers.find(name).bases if is_pane(base, self.headers)]
        return [self.headers.find(name) for name in found]

    def folder(self):
        return self.headers.find(self.class_name).path.split("/")[0] if self.class_name else "dialogs"

    def purpose(self):
        return self.section.paragraphs[0] if self.section else escaped(self.headers.find(self.class_name).about[0])

    def text(self):
        parts = [f"# {self.name}", self.purpose(), self.pictures(), self.made_by()]
        parts += self.mouse_and_keyboard() + self.dialog() + self.record() + self.messages() + self.operations()
        return "\n\n".join(part for part in parts if part) + "\n"

    def pictures(self):
        width = self.golden_width or ElementTree.fromstring(self.example_text()).get("width")
        return "\n".join(self.picture(theme, width) for theme in ("light", "dark"))

    def picture(self, theme, width):
        return f'<img src="images/{self.name}-{theme}.png" width="{width}" alt="{self.name}, {theme}">'

    def example_text(self):
        return file_text(PANES, "dialogs", self.name + ".xml")

    def script_text(self):
        path = os.path.join(PANES, "dialogs", self.name + ".script")
        return file_text(path) if os.path.exists(path) else ""

    def made_by(self):
        if not self.class_name:
            return f"In dialogs the item type `{self.item}`; its class is no part of the interface."
        if not self.item:
            return f"The class `{self.class_name}`, {link(self.headers.find(self.class_name).path)}. " \
                   "Dialogs have no type of item for it: a program derives from it or makes it itself."
        return f"In dialogs the item type `{self.item}`; in programs the class `{self.class_name}`, " \
               f"{link(self.headers.find(self.class_name).path)}."

    def mouse_and_keyboard(self):
        if not self.class_name:
            return ["## Mouse and keyboard", "It takes neither."]
        told = [escaped(text) for text in self.headers.find(self.class_name).about[1:]]
        for name in self.behaves_as:
            told += [f"As every `{name}`:"] + [escaped(text) for text in self.headers.find(name).about[1:]]
        if not self.takes_keys() and not re.search(r"\bkeys\b|keyboard", " ".join(told)):
            told.append("It takes no keys itself.")
        return ["## Mouse and keyboard"] + told

    def takes_keys(self):
        return any(re.search(r"\bint Key\(|\bCompoundPane\b", file_text(TREE, one.path)) for one in self.classes())

    def dialog(self):
        if not self.section:
            return []
        parts = ["## In a dialog"] + self.section.paragraphs[1:]
        if self.section.table:
            parts += ["\n".join(self.section.table)]
        script = self.script_text()
        parts += ["There are further keys that [every item](../dialog-reference.md#every-item) has; how values are written "
                  "stands [at the beginning of the reference](../dialog-reference.md).",
                  f"The pictures show [this dialog](dialogs/{self.name}.xml)" +
                  (f", after [the script](dialogs/{self.name}.script) below it:" if script else ":"),
                  block("xml", self.example_text().split("?>\n", 1)[-1])]
        return parts + ([block("script", script)] if script else [])

    def record(self):
        told = self.reference.record(self.item) if self.item else None
        if not told:
            return []
        parts = ["## In a binary dialog", f"The record begins with {told[0]}, followed by: {told[1]}. See "
                 "[binary dialogs](../dialog-reference.md#binary-dialogs)."]
        if self.record_name:
            rows = [f"| {code(', '.join(field.declarations))} | "
                    f"{field_meaning(field.comment, told[0])} |"
                    for field in self.record_fields(self.record_name)]
            path = self.headers.find(self.record_name).path
            parts += [f"A program hands the values over in a `{self.record_name}` ({link(path)}):",
                      "\n".join(["| Field | Meaning |", "|---|---|"] + rows)]
        return parts

    def record_fields(self, name):
        record = self.headers.find(name)
        return [field for base in record.bases for field in self.record_fields(base)] + record.fields

    def messages(self):
        names = []
        for one in self.classes():
            names += [match.group(1) for base in one.bases if (match := re.match(r"Provider<(\w+)>", base))]
        listeners = [self.headers.find(name) for name in names]
        if not listeners:
            return ["## Messages", "It has no listener."] if self.class_name else []
        parts = ["## Messages"]
        for listener in listeners:
            parts.append(f"`{listener.name}` ({link(listener.path)}). {escaped(' '.join(listener.about))}")
            if listener.operations:
                parts.append(table(("Message", "When"), listener.operations, whole=True))
        return parts

    def operations(self):
        parts = []
        for one in self.classes():
            for told in [one] + one.inner:
                if told.operations and (told is one or not is_value(told)):
                    parts.append(f"### {told.name}" + ("" if told is one else f"\n\n{escaped(' '.join(told.about))}"))
                    parts.append(table(("Operation", "What it does"), told.operations))
        return ["## Operations", "Those that subclasses override are in the headers, and so is what is cut short here."] + \
            parts if parts else []


def field_meaning(comment, kind):
    """What a record's header says of a field, its keys as code."""
    text = re.sub(r'^("\w+")\.$', r"\1", re.sub("kKind|kType", kind, comment))
    return re.sub(r'"(\w+)"', r"`\1`", escaped(text))


def is_value(told):
    """Whether a class has nothing but constructors."""
    name = told.name.split("::")[-1]
    return all(declaration.startswith(name + "(") for group in told.operations for declaration in group.declarations)


def table(titles, operations, whole=False):
    rows = [f"| {titles[0]} | {titles[1]} |", "|---|---|"]
    heading = ""
    for group in operations:
        if group.heading != heading and group.heading:
            short = len(group.heading) <= LONGEST_HEADING
            rows.append(f"| **{escaped(group.heading)}** | |" if short else f"| | *{escaped(group.heading)}* |")
        heading = group.heading
        names = "<br>".join(code(declaration) for declaration in group.declarations)
        rows.append(f"| {names} | {escaped(group.comment if whole else shortened(group.comment))} |")
    return "\n".join(rows)


def index(pages):
    parts = ["# Panes", "What there is, with a picture and a page for each. How these pages are made is in "
             "`CONTRIBUTING.md`; change what they are made from, not the pages."]
    for folder, title in FOLDERS.items():
        rows = [f"| [{page.name}]({page.name}.md) | {page.picture('light', SMALL_WIDTH)} | {page.purpose()} |"
                for page in pages if page.folder() == folder]
        if rows:
            parts.append(f"## {title}\n\n| Pane | | What it is |\n|---|---|---|\n" + "\n".join(rows))
    return "\n\n".join(parts) + "\n"


def made():
    """The text of each file in docs/panes, by its name."""
    headers = Headers(TREE, [folder for folder in FOLDERS if folder != "dialogs"] + [LISTENERS])
    reference = Reference(file_text(DOCS, "dialog-reference.md"))
    pages = [Page(element, headers, reference) for element in ElementTree.parse(os.path.join(PANES, "pages.xml")).getroot()]
    texts = {page.name + ".md": page.text() for page in pages}
    texts["README.md"] = index(pages)
    return texts


def kept():
    """The same as it stands."""
    return {name: file_text(PANES, name) for name in os.listdir(PANES) if name.endswith(".md")}


def wrong_pages(texts, standing):
    return sorted(name for name in texts.keys() | standing.keys() if texts.get(name) != standing.get(name))


def main(arguments):
    texts = made()
    wrong = wrong_pages(texts, kept())
    if arguments == ["--check"]:
        for name in wrong:
            print(f"docs/panes/{name} is not as docs/make_pane_pages.py makes it")
        return 1 if wrong else 0
    for name in wrong:
        if name in texts:
            with open(os.path.join(PANES, name), "w", encoding="utf-8") as file:
                file.write(texts[name])
        else:
            os.remove(os.path.join(PANES, name))
    return 0


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))
