#!/usr/bin/env python3
"""Checks which folder includes and names what.

    CheckLayers.py [TREE]

Prints a line for each violation and ends with 1 if there are any. The table below is the whole rule: an include that it
does not allow is a violation, and so is a source file in a folder that it does not know.
"""
import os
import re
import sys

PANES = ("buttons/", "scrolling/", "lists/", "text/", "menus/", "tabs/", "graphics/")
PANE_LAYER = ("host/", "frame/") + PANES
PROGRAM_LAYER = PANE_LAYER + ("dialogs/", "desktop/Desktop.h", "desktop/SimulatedDesktop.h",
                              "desktop/resources/Resources.h")

# What a file may include from this tree: by folder, the longest entry that fits counts. A name that ends in a slash
# stands for everything below it.
TREE_INCLUDES = {
    "host/": ("host/", "frame/Provider.h"),
    "frame/": ("frame/", "host/"),
    "frame/Provider.h": ("host/TarnError.h",),
    "dialogs/": PANE_LAYER + ("dialogs/", "desktop/"),
    "desktop/": ("desktop/", "host/", "frame/Provider.h"),
    "artwork/compiler/": ("artwork/compiler/", "desktop/resources/AtlasFormat.h"),
    "tools/": PROGRAM_LAYER + ("tools/",),
    "examples/": PROGRAM_LAYER + ("examples/",),
}
TREE_INCLUDES.update({folder: PANE_LAYER for folder in PANES})

# Programs as their readers would write them, each by itself.
EXAMPLES = "examples/"

# Not part of the product: they may look into everything.
FREE_FOLDERS = ("tests/", "bench/", "fuzz/")

STANDARD_HEADERS = frozenset("""
algorithm any array atomic bitset cassert cctype cerrno cfenv cfloat charconv chrono cinttypes climits clocale cmath
complex condition_variable csetjmp csignal cstdarg cstddef cstdint cstdio cstdlib cstring ctime cuchar cwchar cwctype
deque exception execution forward_list fstream functional future initializer_list iomanip ios iosfwd iostream istream
iterator limits list locale map memory memory_resource mutex new numeric optional ostream queue random ratio regex
scoped_allocator set shared_mutex sstream stack stdexcept streambuf string string_view system_error thread tuple
type_traits typeindex typeinfo unordered_map unordered_set utility valarray variant vector
""".split())

# Headers and names of each library outside of the standard, and where they may appear. Boost is allowed everywhere.
LIBRARIES = (
    # what, headers, names, folders
    ("the file system", r"filesystem|fstream", r"std::filesystem\b",
     ("desktop/", "dialogs/", "artwork/", "tools/", "examples/")),
    ("the operating system", r"(unistd|fcntl|dlfcn|cxxabi|poll|pthread|execinfo)\.h|(sys|linux)/.*", None,
     ("desktop/", "artwork/", "tools/")),
    ("SDL", r"SDL.*", r"\bSDL_\w+", ("desktop/windows/Sdl",)),
    ("X", r"X11/.*", None, ("desktop/windows/Sdl", "bench/")),
    ("Cairo", r"(cairo/)?cairo.*\.h", r"\b_?cairo_\w+|\bCAIRO_\w+",
     ("desktop/drawing/", "desktop/type/", "desktop/editing/", "desktop/printing/", "artwork/compiler/")),
    ("pixman", r"(pixman-1/)?pixman.*\.h", r"\bpixman_\w+|\bPIXMAN_\w+",
     ("desktop/drawing/", "desktop/type/", "desktop/printing/")),
    ("Pango", r"pango/.*", r"\bpango_\w+|\bPango[A-Z]\w*|\bPANGO_\w+", ("desktop/type/", "desktop/editing/")),
    ("fontconfig", r"fontconfig/.*", r"\bFc[A-Z]\w+", ("desktop/type/",)),
    ("HarfBuzz", r"(harfbuzz/)?hb.*\.h", r"\bhb_\w+", ("desktop/type/", "desktop/editing/")),
    ("GLib", r"glib.*|gio/.*", r"\bg_(object|free|error|malloc)\w*|\bGError\b",
     ("desktop/type/", "desktop/editing/", "artwork/compiler/")),
    ("ICU", r"unicode/.*", r"\bicu::\w+|\bU_ICU\w+|\bU(Char32|ErrorCode)\b", ("desktop/",)),
    ("pugixml", r"pugi(xml|config)\.hpp", r"\bpugi::", ("desktop/resources/", "artwork/compiler/")),
    ("librsvg", r"(librsvg/)?rsvg.*\.h", r"\brsvg_\w+|\bRsvg[A-Z]\w*", ("artwork/compiler/",)),
    ("libpng", r"png\.h", r"\bpng_\w+", ("desktop/drawing/", "desktop/resources/", "artwork/compiler/")),
    ("CLI11", r"CLI/.*", r"\bCLI::", ("tools/", "artwork/compiler/")),
)

SOURCE_SUFFIXES = (".h", ".cpp")
SKIPPED_FOLDERS = ("build", "out")
INCLUDE = re.compile(r'^[ \t]*#[ \t]*include[ \t]*(["<])([^">]+)[">]', re.MULTILINE)
# A string, character or raw string, or a comment; whichever begins first.
NOT_CODE = re.compile(r'R"(?P<end>[^(\s]*)\(.*?\)(?P=end)"|"(?:\\.|[^"\\\n])*"|\'(?:\\.|[^\'\\\n])*\'|//[^\n]*|/\*.*?\*/',
                      re.DOTALL)


def without_comments(text):
    """The text with comments and the content of strings blanked out, line breaks kept."""
    return NOT_CODE.sub(lambda match: re.sub(r"[^\n]", " ", match.group()), text)


def comments_only_blanked(text):
    """The text without comments; strings stay, since includes are written with quotes."""
    def blank(match):
        return match.group() if match.group()[0] not in "/" else re.sub(r"[^\n]", " ", match.group())
    return NOT_CODE.sub(blank, text)


def fits(path, entries):
    return any(path == entry or (not entry.endswith(".h") and path.startswith(entry)) for entry in entries)


def tree_rule(path):
    """What the file may include from the tree; None when no entry fits it."""
    fitting = [entry for entry in TREE_INCLUDES if fits(path, (entry,))]
    return TREE_INCLUDES[max(fitting, key=len)] if fitting else None


def library_of(header):
    for library in LIBRARIES:
        if re.fullmatch(library[1], header):
            return library
    return None


def line_of(text, position):
    return text.count("\n", 0, position) + 1


def is_beside(path, header, tree):
    """Whether an example, which knows nothing of this tree, includes a header of its own."""
    return path.startswith(EXAMPLES) and "/" not in header and \
        os.path.exists(os.path.join(tree, os.path.dirname(path), header))


def include_violations(path, text, tree):
    for match in INCLUDE.finditer(comments_only_blanked(text)):
        kind, header = match.groups()
        where = f"{path}:{line_of(text, match.start())}"
        if kind == '"':
            if is_beside(path, header, tree):
                continue
            if not fits(header, tree_rule(path)):
                yield f'{where}: must not include "{header}"'
            elif not os.path.exists(os.path.join(tree, header)):
                yield f'{where}: "{header}" does not exist; includes are written from the top of the tree'
            continue
        library = library_of(header)
        if library:
            if not fits(path, library[3]):
                yield f"{where}: must not include {library[0]} (<{header}>)"
        elif header not in STANDARD_HEADERS and not header.startswith("boost/"):
            yield f"{where}: <{header}> is no header that this tree knows"


def name_violations(path, text):
    code = without_comments(text)
    for library, _, names, folders in LIBRARIES:
        if not names or fits(path, folders):
            continue
        match = re.search(names, code)
        if match:
            yield f"{path}:{line_of(code, match.start())}: must not name {library} ({match.group()})"


def sources(tree):
    for folder, subfolders, files in os.walk(tree):
        at_top = os.path.samefile(folder, tree)
        subfolders[:] = sorted(name for name in subfolders if not name.startswith(".")
                               and not (at_top and name.startswith(SKIPPED_FOLDERS)))
        for name in sorted(files):
            if name.endswith(SOURCE_SUFFIXES):
                yield os.path.relpath(os.path.join(folder, name), tree).replace(os.sep, "/")


def violations(tree):
    found = 0
    for path in sources(tree):
        found += 1
        if path.startswith(FREE_FOLDERS):
            continue
        if tree_rule(path) is None:
            yield f"{path}: the table of layers does not know this folder"
            continue
        with open(os.path.join(tree, path), encoding="utf-8") as file:
            text = file.read()
        yield from include_violations(path, text, tree)
        yield from name_violations(path, text)
    if not found:
        yield f"{tree}: no sources"


def main():
    tree = sys.argv[1] if len(sys.argv) > 1 else os.getcwd()
    lines = list(violations(tree))
    for line in lines:
        print(line)
    return 1 if lines else 0


if __name__ == "__main__":
    sys.exit(main())
