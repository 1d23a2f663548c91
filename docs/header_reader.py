"""Reads what the headers tell of a class: what it is for, its bases, operations and fields with their comments.

The habits of the headers are those that doxygen_filter.py spells out.
"""
import os
import re

from doxygen_filter import ACCESS, COMMENT, STRINGS, belongs_to_something, comment_block, split_trailing

CLASS = re.compile(r"(class|struct)\s+(\w+)\s*(?::(?!:)\s*([^{;]*))?\{")
BASE = re.compile(r"(?:public|protected|private)?\s*(?:virtual\s+)?(\w+(?:<\w+>)?)\s*$")
# What is no operation, or none that a reader looks for.
SKIPPED = re.compile(r"(friend|typedef|using|enum|template|extern|class|struct)\b"
                     r"|.*(\boverride\b|\boperator\b|= (delete|default)$)")
CONSTANT = re.compile(r"static (const|constexpr|short const|\w+ const)\b[^(]*=")


class Told:
    """Declarations that share a comment."""

    def __init__(self, heading, declarations, comment):
        self.heading, self.declarations, self.comment = heading, declarations, comment


class Class:
    def __init__(self, name, path, about, bases):
        self.name, self.path, self.about, self.bases = name, path, about, bases
        self.operations = []
        self.fields = []
        self.inner = []


def paragraphs(texts):
    """Comment lines as paragraphs."""
    return [" ".join(part.split()) for part in "\n".join(texts).split("\n\n") if part.strip()]


class Body:
    """The lines between the braces of a class, declaration by declaration."""

    def __init__(self, lines, start, owner, access):
        self.lines, self.at, self.owner, self.access = lines, start, owner, access
        self.heading = ""
        self.comment, self.fresh = "", False

    def read(self):
        while self.at < len(self.lines) and not re.match(r"\s*\}", self.lines[self.at]):
            self.read_line(self.lines[self.at])
        self.at += 1
        return self.owner

    def read_line(self, line):
        access = ACCESS.match(line)
        if access:
            self.access, self.heading, self.comment = access.group(1), "", ""
            self.at += 1
        elif not line.strip() or line.lstrip().startswith("#"):
            self.comment = ""
            self.at += 1
        elif COMMENT.match(line):
            self.read_comment()
        elif CLASS.search(line) and not line.lstrip().startswith("enum"):
            self.read_inner_class(line)
        else:
            self.read_declaration()

    def read_comment(self):
        texts, self.at = comment_block(self.lines, self.at)
        text = " ".join(paragraphs(texts))
        if belongs_to_something(self.lines, self.at):
            self.comment, self.fresh = text, True
        else:
            self.heading, self.comment = text, ""

    def read_inner_class(self, line):
        match = CLASS.search(line)
        if line.count("{") == line.count("}"):
            self.at += 1
            return
        about = [self.comment] if self.comment else []
        inner = Class(f"{self.owner.name}::{match.group(2)}", self.owner.path, about, [])
        Body(self.lines, self.at + 1, inner, "private" if match.group(1) == "class" else "public").read_into(self)
        if self.access == "public":
            self.owner.inner.append(inner)
        self.comment = ""

    def read_into(self, outer):
        self.read()
        outer.at = self.at

    def read_declaration(self):
        text, trailing, depth = "", [], 0
        while True:
            code, column, comment = split_trailing(self.lines[self.at])
            self.at += 1
            bare = STRINGS.sub('""', code)
            depth += bare.count("{") + bare.count("(") - bare.count("}") - bare.count(")")
            text += " " + code.strip()
            if comment is not None and (depth == 0 or "{" not in text):
                trailing = [comment] + self.lines_in_column(column)
            if depth == 0 and text.endswith((";", "}")):
                break
        self.keep(signature(text), " ".join(trailing))

    def lines_in_column(self, column):
        texts = []
        while self.at < len(self.lines) and re.match(rf" {{{column}}}//", self.lines[self.at]):
            texts.append(COMMENT.match(self.lines[self.at]).group(2))
            self.at += 1
        return texts

    def keep(self, declaration, trailing):
        above = self.comment if self.fresh or not trailing else ""
        comment = " ".join(sentence(part) for part in (trailing, above) if part)
        shared = bool(self.comment) and not self.fresh and not trailing
        self.fresh = False
        if self.access != "public" or SKIPPED.match(declaration) or CONSTANT.match(declaration):
            return
        kept = self.owner.operations if "(" in declaration else self.owner.fields
        if re.match(rf"~|{re.escape(self.owner.name.split('::')[-1])}\(" + ("" if not comment else r"\)$"), declaration):
            return
        if shared and kept and kept[-1].comment == comment:
            kept[-1].declarations.append(declaration)
        else:
            kept.append(Told(self.heading, [declaration], comment))


def sentence(comment):
    """A comment as a sentence: without what is meant for tools, with a full stop, and a capital before a plain word."""
    text = re.sub(r"\s*NOLINT.*", "", comment)
    if not text:
        return ""
    text += "" if text.endswith((".", ":")) else "."
    return text[0].upper() + text[1:] if re.match(r"[a-z]+\b(?![(:_])", text) else text


def signature(text):
    """A declaration without body, initialisers and what only the compiler wants."""
    text = re.sub(r"/\*(\w+)\*/", r"\1", text)
    text = re.sub(r"\s*(?<!:):(?!:)\s*\w+\(.*", "", text) if re.match(r"\s*(explicit\s+)?\w+\(", text) else text
    text = re.sub(r"\s*\{.*", "", text, flags=re.DOTALL).strip().rstrip(";")
    text = re.sub(r"\s*= 0$", "", text)
    return re.sub(r"^(virtual|explicit) ", "", " ".join(text.split()))


def bases_of(text):
    """The names of the bases, a template with its argument."""
    matches = (BASE.match(part.strip()) for part in (text or "").split(","))
    return [match.group(1) for match in matches if match]


class Headers:
    """The headers of some folders, found by the name of a class that is named after its file."""

    def __init__(self, tree, folders):
        self.tree, self.paths, self.read_classes = tree, {}, {}
        for folder in folders:
            for name in os.listdir(os.path.join(tree, folder)):
                if name.endswith(".h"):
                    self.paths[name[:-2]] = f"{folder}/{name}"

    def has(self, name):
        return name in self.paths

    def find(self, name):
        if name not in self.read_classes:
            with open(os.path.join(self.tree, self.paths[name]), encoding="utf-8") as file:
                self.read_classes[name] = read_class(file.read().splitlines(), name, self.paths[name])
        return self.read_classes[name]


def read_class(lines, name, path):
    """The class of that name in the lines of its header."""
    about = paragraphs(comment_block(lines, 0)[0])
    for start, line in enumerate(lines):
        if not re.match(rf"(class|struct) {name}\b", line):
            continue
        end = start
        while "{" not in lines[end] and ";" not in lines[end]:
            end += 1
        match = CLASS.match(" ".join(" ".join(lines[start:end + 1]).split()))
        if match:
            owner = Class(name, path, about, bases_of(match.group(3)))
            return Body(lines, end + 1, owner, "private" if match.group(1) == "class" else "public").read()
    raise ValueError(f"{path} has no class {name}")
