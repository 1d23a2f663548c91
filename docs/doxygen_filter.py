#!/usr/bin/env python3
"""Turns the plain comments of a header into Doxygen's, for FILTER_PATTERNS.

    doxygen_filter.py HEADER

The headers keep to a few habits, and this file is where they are spelt out for Doxygen:

- the comment at the top of a file is about the file, and about the class or namespace that is named after the file
- a comment belongs to all declarations below it, up to the next blank line or comment; to a type only if it is directly
  above that, or above another type
- a comment at the end of a line belongs to what stands before it, a type that begins there included, and goes on where the next lines hold nothing but a
  comment in the same column
- a comment with a blank line below it belongs to nothing
- constructors and assignments without a comment are told by that of their class
"""
import os
import re
import sys

COMMENT = re.compile(r"(\s*)//(?!/) ?(.*)$")
# A comment at the end of a line of code. Strings before it are skipped, so that slashes in one do not count.
TRAILING = re.compile(r'((?:[^"/\']|"(?:\\.|[^"\\])*"|\'(?:\\.|[^\'\\])*\'|/(?!/))*?\S)(\s*)//(?!/) ?(.*)$')
STRINGS = re.compile(r'"(?:\\.|[^"\\])*"|\'(?:\\.|[^\'\\])*\'')
# What stands before the brace of a type or namespace, but not before that of a function. Template parameters are
# classes too, so the last one counts.
STRUCTURE = re.compile(r"(?s:.*)\b(?:namespace|class|struct|union|enum(?: class)?)\b\s*(\w*)[^()]*$")
TYPE = re.compile(r"\s*(template\s*<.*>\s*)?(class|struct|union|enum|namespace)\b")
FORWARD = re.compile(r"\s*(template\s*<[^>]*>\s*)?(class|struct|enum)\s+\w+(\s*:\s*\w+)?\s*;")
ACCESS = re.compile(r"\s*(public|protected|private)\s*:")
NAME = r"\w+(?:\s*=\s*[^,;(){}]+)?"
FIELDS = re.compile(rf"(\s*(?:[\w:]+\s+)+)({NAME}(?:,\s*{NAME})+);$")
INDENTED = "    "
TOLD_BY_CLASS = "/// See the class."


def escaped(text):
    """The text with everything that Doxygen would take for a command or a tag made plain; code in backticks stays."""
    parts = re.split(r"(`[^`]*`)", text)
    return "".join(part if part.startswith("`") else re.sub(r"([\\@<>#%&$]|(?<!\w)::)", r"\\\1", part)
                   for part in parts)


def prose(lines):
    """Comment lines as Doxygen's; indented ones are code and stay as they are."""
    return ["/// " + (line if line.startswith(INDENTED) else escaped(line)) for line in lines]


class Scanner:
    """Follows braces and statements: where declarations begin, what is the body of a function, and which class is open."""

    def __init__(self):
        self.open_braces = []  # the name of a type or namespace, None for any other brace
        self.statement = ""    # what has been read of the declaration that has begun

    def in_body(self):
        return None in self.open_braces

    def at_start(self):
        return not self.statement.strip() and not self.in_body()

    def class_name(self):
        return self.open_braces[-1] if self.open_braces else ""

    def read(self, code):
        if code.lstrip().startswith("#") or ACCESS.match(code):
            return
        for character in STRINGS.sub('""', code) + "\n":
            self.take(character)

    def take(self, character):
        if character == "{":
            match = STRUCTURE.search(self.statement)
            self.open_braces.append(match.group(1) if match else None)
            if match:
                self.statement = ""
        elif character == "}":
            if self.open_braces:
                self.open_braces.pop()
            # A brace within an initialiser or an argument list ends nothing.
            if not self.statement.rstrip().endswith(("(", "=", ",")):
                self.statement = ""
        elif self.in_body():
            return
        elif character == ";":
            self.statement = ""
        else:
            self.statement += character


def comment_block(lines, start):
    """The texts of the comment lines from start on, all in one column, and the line after them."""
    texts, indent, i = [], None, start
    while i < len(lines):
        match = COMMENT.match(lines[i])
        if not match or indent not in (None, match.group(1)):
            break
        indent = match.group(1)
        texts.append(match.group(2))
        i += 1
    return texts, i


def belongs_to_something(lines, after):
    return after < len(lines) and lines[after].strip() and not lines[after].lstrip().startswith(("#", "}"))


def split_trailing(line):
    """The code of a line, and the column and text of the comment at its end; None for the text when there is none."""
    match = TRAILING.match(line)
    if not match:
        return line, 0, None
    return match.group(1), len(match.group(1) + match.group(2)), match.group(3)


def one_by_one(code):
    """The declaration of several fields as one declaration for each; any other line as it is."""
    match = FIELDS.match(code)
    return [match.group(1) + name.strip() + ";" for name in match.group(2).split(",")] if match else [code]


class Filter:
    def __init__(self, lines, file_name):
        name = re.escape(os.path.splitext(file_name)[0])
        self.namesake = re.compile(rf"(template\s*<.*>\s*)?(class|struct|namespace)\s+{name}\b(?!\s*;)")
        self.lines = lines
        self.scanner = Scanner()
        self.belonging = []  # the comment that the next declarations get
        self.fresh = False   # nothing has got it yet
        self.for_types = False
        header, self.at = comment_block(lines, 0)
        self.header = prose(header)
        self.output = ["/// \\file"] + self.header if header else []

    def run(self):
        while self.at < len(self.lines):
            line = self.lines[self.at]
            if self.scanner.in_body():
                self.output.append(line)
                self.scanner.read(split_trailing(line)[0])
                self.at += 1
            elif COMMENT.match(line):
                texts, self.at = comment_block(self.lines, self.at)
                self.belonging = prose(texts) if belongs_to_something(self.lines, self.at) else []
                self.fresh = True
            else:
                self.code_line(line)
        return self.output

    def code_line(self, line):
        code, column, trailing = split_trailing(line)
        self.at += 1
        before = []
        if not code.strip() or code.lstrip().startswith(("#", "}")) or ACCESS.match(code):
            self.belonging = []
        elif self.scanner.at_start() and not FORWARD.match(code):
            before = self.comment_before(code, trailing)
            self.fresh = False
        self.scanner.read(code)
        # In the first line of a body the comment is about what happens there, and after a brace about what it closes.
        is_prose = trailing is None or self.scanner.in_body() or code.lstrip().startswith("}")
        after = [] if is_prose else self.trailing_lines(column, trailing)
        if after and TYPE.match(code) and not FORWARD.match(code):
            before, after = [text.replace("///<", "///") for text in after], []
        for declaration in one_by_one(code) if before or after else [code]:
            self.output += before
            self.output.append(declaration + (" " + after[0] if after else ""))
            self.output += [" " * column + more for more in after[1:]]

    def comment_before(self, code, trailing):
        is_type = bool(TYPE.match(code))
        if self.fresh:
            self.for_types = is_type
        if self.belonging and (self.fresh or (trailing is None and is_type <= self.for_types)):
            return self.belonging
        if self.namesake.match(code.strip()):
            return self.header
        name = re.escape(self.scanner.class_name() or "")
        if name and trailing is None and re.match(rf"\s*(explicit\s+)?({name}\(|{name} &operator=)", code):
            return [TOLD_BY_CLASS]
        return []

    def trailing_lines(self, column, first):
        texts = [first]
        while self.at < len(self.lines) and re.match(rf" {{{column}}}//", self.lines[self.at]):
            texts.append(COMMENT.match(self.lines[self.at]).group(2))
            self.at += 1
        return ["///< " + escaped(text) for text in texts]


def filtered(lines, file_name):
    return Filter(lines, file_name).run()


def main():
    path = sys.argv[1]
    with open(path, encoding="utf-8") as file:
        lines = file.read().splitlines()
    print("\n".join(filtered(lines, os.path.basename(path))))


if __name__ == "__main__":
    main()
