#!/usr/bin/env python3
"""Writes which functions of the libraries answer somebody who uses the gallery, those that run together side by side.

    Order.py GALLERY FOLDER

Each page is opened on the X server that DISPLAY names, by callgrind, and two panes of each class on it are clicked,
dragged, turned the wheel over and typed into. What runs until the page stands is not counted. FOLDER/NAME.txt gets the
symbols of libglogNAME.
"""
import collections
import json
import pathlib
import re
import subprocess
import sys
import tempfile
import time

LONGEST_START_SECONDS = 120
PAUSE_SECONDS = 0.1  # under callgrind an answer takes about as long
MOST_OF_A_CLASS = 2  # on one page
DRAG_PIXELS = (9, 5)
PAGE_ITEM = 9001  # what the gallery shows a page in
LIBRARY = re.compile(r"/libglog(\w+)\.so")

# Opens what a click opens, chooses in it and closes it; takes hold and drags; types where typing goes.
ANSWERED = [
    ["click", "5"], ["click", "4"],
    ["click", "1"], ["key", "Down"], ["key", "Escape"],
    ["mousedown", "1", "mousemove_relative", "--", *map(str, DRAG_PIXELS), "mousemove_relative", "--",
     *map(str, DRAG_PIXELS), "mouseup", "1"], ["key", "Escape"],
    ["key", "a", "key", "BackSpace", "key", "Tab"],
]


def page_names(folder):
    """The names that --page takes, in the order of the gallery."""
    pages = [re.fullmatch(r"(\d+)-(.+)\.xml", path.name) for path in folder.glob("*.xml")]
    return [page[2] for page in sorted(filter(None, pages), key=lambda page: int(page[1]))]


def places(pane, top=0, left=0, inside=False):
    """Class and middle of all panes of the page that can be seen and have none within, in the window's coordinates."""
    if not pane.get("visible", True):
        return
    box_top, box_left, box_bottom, box_right = pane.get("box", [0, 0, 0, 0])
    top, left = top + box_top, left + box_left
    inside = inside or pane.get("id") == PAGE_ITEM
    parts = pane.get("panes", [])
    if inside and not parts:
        yield pane["class"], (left + (box_right - box_left) // 2, top + (box_bottom - box_top) // 2)
    for part in parts:
        yield from places(part, top, left, inside)


def samples(panes):
    """The middles of the first few of each class."""
    found = collections.defaultdict(list)
    for kind, middle in panes:
        if len(found[kind]) < MOST_OF_A_CLASS:
            found[kind].append(middle)
    return [middle for middles in found.values() for middle in middles]


def do(*steps):
    subprocess.run(["xdotool", *steps], check=True, stdout=subprocess.DEVNULL)


class Watched:
    """The gallery, run by callgrind, and the functions that have run in it."""

    def __init__(self, gallery, page, work):
        self.profile = work / f"{page}.out"
        self.dumps = 0
        self.program = subprocess.Popen(
            ["valgrind", "-q", "--tool=callgrind", "--demangle=no", f"--callgrind-out-file={self.profile}", gallery,
             "--page", page, "--scale", "1"], cwd=work)

    def functions(self):
        """What has run since the last time, as library and symbol."""
        subprocess.run(["vgdb", f"--pid={self.program.pid}", "dump"], check=True, capture_output=True)
        self.dumps += 1
        dump = self.profile.with_name(f"{self.profile.name}.{self.dumps}")
        found = functions_in(dump)
        dump.unlink()
        return found

    def end(self):
        self.program.kill()
        self.program.wait()


def functions_in(profile):
    """Library and symbol of every function that the profile has instructions of."""
    libraries, symbols, found = {}, {}, set()
    library = symbol = None
    for line in profile.read_text(encoding="utf-8", errors="replace").splitlines():
        name = re.match(r"c?(ob|fn)=\((\d+)\)(?: (.*))?", line)
        if not name:
            continue
        kind, number, text = name.groups()
        known = libraries if kind == "ob" else symbols
        if text:
            known[number] = text
        if line.startswith("ob="):
            library = LIBRARY.search(known[number])
        elif line.startswith("fn="):
            symbol = known[number].partition("'")[0]  # without the mark of a call from within itself
            if library:
                found.add((library[1], symbol))
    return found


def measure(gallery, page, work):
    """The functions that each step on the page has run, a set for each."""
    subprocess.run([gallery, "--page", page, "--script", "dump.script"], check=True, cwd=work)
    spots = samples(places(json.loads((work / "tree.json").read_text(encoding="utf-8"))))
    watched = Watched(gallery, page, work)
    try:
        window = subprocess.run(["timeout", str(LONGEST_START_SECONDS), "xdotool", "search", "--sync",
                                 "--onlyvisible", "--name", "^Glog Panes"],
                                check=True, capture_output=True, text=True).stdout.split()[-1]
        do("windowfocus", "--sync", window)
        time.sleep(1)
        watched.functions()
        steps = []
        for h, v in spots:
            for step in [["mousemove", "--window", window, str(h), str(v)], *ANSWERED]:
                do(*step)
                time.sleep(PAUSE_SECONDS)
                steps.append(watched.functions())
        return steps
    finally:
        watched.end()


def aliases(library):
    """All names that the function of a symbol has, as constructors have two; copies that the compiler made have none."""
    at = collections.defaultdict(list)
    for line in subprocess.run(["nm", "--defined-only", library], check=True, capture_output=True,
                               text=True).stdout.splitlines():
        address, _, symbol = line.split(" ", 2)
        at[address].append(symbol)
    return {symbol: [name for name in names if "." not in name] for names in at.values() for symbol in names}


def ordered(steps):
    """All symbols, each followed by the one that runs most often with it, as a part of how often either runs."""
    runs = collections.defaultdict(set)
    for number, step in enumerate(set(map(frozenset, steps))):  # what happens all the time says no more than once
        for symbol in step:
            runs[symbol].add(number)
    left = dict(sorted(runs.items()))
    latest = max(left, key=lambda symbol: len(left[symbol]))
    order = []
    while True:
        order.append(latest)
        of_latest = left.pop(latest)
        if not left:
            return order
        latest = max(left, key=lambda symbol: len(left[symbol] & of_latest) / len(left[symbol] | of_latest))


def main():
    if len(sys.argv) != 3:
        sys.exit(__doc__)
    gallery = pathlib.Path(sys.argv[1]).resolve()
    folder = pathlib.Path(sys.argv[2])
    steps = collections.defaultdict(list)  # by library, the symbols that each has run
    with tempfile.TemporaryDirectory() as name:
        work = pathlib.Path(name)
        (work / "dump.script").write_text("dump tree.json\n", encoding="utf-8")
        for page in page_names(pathlib.Path(__file__).resolve().parents[2] / "tools/gallery/pages"):
            measured = measure(str(gallery), page, work)
            print(f"{page}: {len(set().union(*measured))} functions", flush=True)
            for found in measured:
                for library in {library for library, _ in found}:
                    steps[library].append({symbol for other, symbol in found if other == library})
    for library in sorted(steps):
        names = aliases(gallery.parents[1] / f"lib/libglog{library}.so")
        symbols = [name for symbol in ordered(steps[library]) for name in names.get(symbol, [])]
        (folder / f"{library}.txt").write_text(
            "# How the code of the library is laid out, written by bench/order/run.\n" +
            "".join(f"{symbol}\n" for symbol in dict.fromkeys(symbols)), encoding="utf-8")
        print(f"{library}: {len(symbols)} names")


if __name__ == "__main__":
    main()
