#!/usr/bin/env python3
"""Prints what the benchmarks measured, beside what they are measured against.

    Table.py [--check] FILE...

Takes the median of all repetitions of a benchmark. With --check the exit status is 1 when a goal is missed.
"""
import argparse
import json
import statistics
import sys
from collections import namedtuple

# A measurement beside another one of the same run. `most` is the goal for their ratio, None where there is none, and
# `clock` the time that counts: "cpu_time", of the processor, or "real_time", by the clock.
Ratio = namedtuple("Ratio", "what measured beside most clock", defaults=(None, "cpu_time"))
# A measurement with a goal of its own, in a unit that stands for so many of the file's: a time, or a counter of the
# benchmark.
Amount = namedtuple("Amount", "what measured unit size most clock", defaults=(None, "real_time"))

# How benchmarks are called that run a fixed number of times and measure their time themselves.
BUILDS = "/iterations:8/manual_time"

# A message to nobody is one pointer test, as the other is. What is left is the error of measuring a cycle or two.
POINTER_TEST = 1.5
# Of ten times as many check boxes each takes as long, but for the caches of the processor.
LINEAR = 1.5
# What is out of sight costs nothing but a look at where it lies.
OUT_OF_SIGHT = 1.2
# Rows that do not show cost nothing at all.
ROWS = 1.15
# Erasing the rows, clips and frame come to the texts.
TEXTS_OF_A_LIST = 1.5
# Colours and the pane's place come to the text.
STATIC_TEXT = 1.2
# Paragraphs that do not show cost nothing but the way to the one that is changed.
PARAGRAPHS = 1.5

RATIOS = (
    Ratio("message to nobody / pointer test", "Broadcast/ours/0", "Broadcast/bare/0", POINTER_TEST),
    Ratio("message to 1 dependent / plain loop", "Broadcast/ours/1", "Broadcast/bare/1", 2.0),
    Ratio("message to 10 dependents / plain loop", "Broadcast/ours/10", "Broadcast/bare/10", 2.0),
    Ratio("message to 100 dependents / plain loop", "Broadcast/ours/100", "Broadcast/bare/100", 2.0),
    Ratio("icon / pixman", "Icon/ours", "Icon/bare", 1.5),
    Ratio("run of tiles / pixman", "Tiles/ours", "Tiles/bare", 1.5),
    Ratio("rectangle / pixman", "Rectangle/ours", "Rectangle/bare", 1.5),
    Ratio("horizontal line / pixman", "Line/ours", "Line/bare", 1.5),
    Ratio("label, its layout cached / Pango", "Text/ours at a point", "Text/bare", 1.2),
    Ratio("button label, layout cached / Pango", "Text/ours in a rectangle", "Text/bare", 1.2),
    Ratio("static text in lines / Pango", "Static text/ours", "Static text/bare", STATIC_TEXT),
    Ratio("whole label pane / Pango", "Label/ours", "Text/bare"),
    Ratio("whole oval button / pixman and Pango", "Button/ours", "Button/bare"),
    Ratio("redraw of 200 panes / texts by Pango", "Redraw/all", "Redraw/all bare"),
    Ratio("redraw of 16 x 16 / of 200 panes", "Redraw/spot", "Redraw/all", 0.02),
    Ratio("redraw of a button / of 200 panes", "Redraw/button", "Redraw/all"),
    Ratio("1 of 10,000 buttons made / of 1,000", "Build/group/10000" + BUILDS, "Build/group/1000" + BUILDS,
          LINEAR, "real_time"),
    Ratio("1 of 10,000 panes made / of 1,000", "Build/panes/10000" + BUILDS, "Build/panes/1000" + BUILDS,
          LINEAR, "real_time"),
    Ratio("1 of 10,000 panes closed / of 1,000", "Close/panes/10000" + BUILDS, "Close/panes/1000" + BUILDS,
          None, "real_time"),
    Ratio("toggle 1 of 10,000 buttons / of 1,000", "Toggle/group/10000", "Toggle/group/1000"),
    Ratio("toggle 1 of 10,000 panes / of 1,000", "Toggle/panes/10000", "Toggle/panes/1000"),
    Ratio("scroll step among 2,000 members / 100", "Scroll/grid/2000/manual_time", "Scroll/grid/100/manual_time",
          OUT_OF_SIGHT, "real_time"),
    Ratio("scroll step in 30,000 pixels / 600", "Scroll/pane/30000", "Scroll/pane/600", OUT_OF_SIGHT),
    Ratio("scroll step among 100 members / moved", "Scroll/grid/100/manual_time", "Scroll/bare",
          None, "real_time"),
    Ratio("scroll step of a pane / moved", "Scroll/pane/600", "Scroll/bare"),
    Ratio("menu opened / its texts by Pango", "Menu/open/20", "Menu/open bare"),
    Ratio("40 tabs / their texts by Pango", "Tabs/repaint", "Tabs/repaint bare"),
    Ratio("menu of 1,000 items opened / of 20", "Menu/open/1000", "Menu/open/20", OUT_OF_SIGHT),
    Ratio("whole list / its texts by Pango", "List/repaint/1000000", "List/repaint bare", TEXTS_OF_A_LIST),
    Ratio("first frame of 1,000,000 rows / 1,000", "List/first frame/1000000/manual_time",
          "List/first frame/1000/manual_time", ROWS, "real_time"),
    Ratio("repaint of 1,000,000 rows / 1,000", "List/repaint/1000000", "List/repaint/1000", ROWS),
    Ratio("scroll step in 1,000,000 rows / 1,000", "List/scroll to and fro/1000000", "List/scroll to and fro/1000",
          ROWS),
    Ratio("the same to a row that is new", "List/scroll on/1000000", "List/scroll on/1000", ROWS),
    Ratio("jump among 1,000,000 rows / 1,000", "List/jump/1000000", "List/jump/1000", ROWS),
    Ratio("click among 1,000,000 rows / 1,000", "List/click/1000000/manual_time", "List/click/1000/manual_time", ROWS,
          "real_time"),
    Ratio("select 1 of 1,000,000 rows / of 1,000", "List/select one/1000000", "List/select one/1000", ROWS),
    Ratio("letter typed in 10,000 lines / 100", "TypeInTheMiddle/10000", "TypeInTheMiddle/100", PARAGRAPHS),
    Ratio("letter typed in 1,000,000 lines / 100", "TypeInTheMiddle/1000000", "TypeInTheMiddle/100", PARAGRAPHS),
    Ratio("text of 600 x 400 / lines by Pango", "DrawAllThatShows", "DrawAllThatShowsBare"),
    Ratio("drag step in a cube / Cairo", "Panner/drag step", "Panner/drag step bare"),
    Ratio("graph of 1,000 points / Cairo", "Graph/repaint/1000", "Graph/repaint bare/1000"),
    Ratio("start to first frame / bare program", "Start/ours", "Start/bare", 1.15, "real_time"),
    Ratio("processor time of it / bare program", "Start/ours", "Start/bare"),
)
AMOUNTS = (
    Amount("click to listener", "Click to listener/manual_time", "us", 1e3),
    Amount("click on the last of 1,000 buttons", "Click/group/1000/manual_time", "us", 1e3, 20),
    Amount("click on the lowest of 1,000 panes", "Click/panes/1000/manual_time", "us", 1e3),
    Amount("shown beyond 1 of 10,000 buttons", "Toggle/group/10000", "px", 1, 0, "beyond"),
    Amount("shown beyond 1 of 10,000 panes", "Toggle/panes/10000", "px", 1, 0, "beyond"),
    Amount("40 tabs fitted into a width", "Tabs/fit", "us", 1e3, 100, "cpu_time"),
    Amount("40 tabs fitted and repainted", "Tabs/fit and repaint", "us", 1e3, 500, "cpu_time"),
    Amount("repaint of a list of 600 x 400", "List/repaint/1000000", "us", 1e3, None, "cpu_time"),
    Amount("click to listener of a list", "List/click/1000000/manual_time", "us", 1e3),
    Amount("set count, a row", "List/set count/manual_time", "ns", 1, 10, "perRow"),
    Amount("select all, a row", "List/select all/manual_time", "ns", 1, 10, "perRow"),
    Amount("deselect all, a row", "List/deselect all/manual_time", "ns", 1, 10, "perRow"),
    Amount("memory of several rows, each", "List/bytes of several/iterations:3", "B", 1, 4, "perRow"),
    Amount("memory of one row among them, each", "List/bytes of one/iterations:3", "B", 1, 0.01, "perRow"),
    Amount("line broken in 1,000,000, and joined", "BreakALineAndJoinIt/1000000", "ms", 1e6, 2, "cpu_time"),
    Amount("letter typed in a field", "TypeInAField", "us", 1e3, None, "cpu_time"),
    Amount("letter typed in a full one", "TypeInAFullField", "ms", 1e6, 100, "cpu_time"),
    Amount("step to and fro in it", "StepInAFullField", "ms", 1e6, 10, "cpu_time"),
    Amount("text of 10 MB to its first frame", "OpenTenMillionUnits", "ms", 1e6, 500),
    Amount("memory of it, times the text", "OpenTenMillionUnits", "", 1, 6, "timesTheText"),
    Amount("drag step in a cube, at 2x", "Panner/drag step", "us", 1e3, 1000, "cpu_time"),
    Amount("graph of 1,000 points, at 2x", "Graph/repaint/1000", "us", 1e3, None, "cpu_time"),
    Amount("graph of 100,000 points, at 2x", "Graph/repaint/100000", "us", 1e3, 20000, "cpu_time"),
    Amount("unseen step of progress", "Progress/unseen step", "us", 1e3, 1, "cpu_time"),
    Amount("resident memory", "Idle/resident", "MB", 1024 * 1024, 24),
    Amount("wake-ups of an idle window", "Idle/wake-ups", "", 1, 1),
)

SIZES = {"ns": 1, "us": 1e3, "ms": 1e6, "s": 1e9, "count": 1, "bytes": 1}
COUNTERS = ("beyond", "perRow", "timesTheText")
MARKS = {True: "PASS", False: "over"}


def read(paths):
    """Values by name and clock or counter, in nanoseconds where they are times."""
    values = {}
    for path in paths:
        with open(path, encoding="utf-8") as file:
            entries = json.load(file)["benchmarks"]
        for entry in entries:
            if entry.get("error_occurred"):
                sys.exit(f"{entry['name']}: {entry['error_message']}")
            if entry["run_type"] != "iteration":
                continue
            for clock in ("cpu_time", "real_time"):
                values.setdefault((entry["name"], clock), []).append(entry[clock] * SIZES[entry["time_unit"]])
            for counter in COUNTERS:
                if counter in entry:
                    values.setdefault((entry["name"], counter), []).append(entry[counter])
    return values


def time_text(nanoseconds):
    for unit in ("s", "ms", "us"):
        if nanoseconds >= SIZES[unit]:
            return f"{nanoseconds / SIZES[unit]:.3g} {unit}"
    return f"{nanoseconds:.3g} ns"


def row(what, measured, beside, value, most):
    """Prints a line; whether its goal, if it has one, is missed."""
    goal, mark = ("", "") if most is None else (f"{most:g}", MARKS[value <= most])
    print(f"{what:40} {measured:>10} {beside:>10} {value:9.3f} {goal:>6} {mark}".rstrip())
    return mark == MARKS[False]


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--check", action="store_true")
    parser.add_argument("files", nargs="+")
    options = parser.parse_args()
    values = read(options.files)

    def median(name, clock):
        if (name, clock) not in values:
            sys.exit(f"there is no measurement of {name}")
        return statistics.median(values[name, clock])

    missed = 0
    print(f"{'':40} {'measured':>10} {'beside':>10} {'value':>9} {'goal':>6}")
    for ratio in RATIOS:
        measured, beside = median(ratio.measured, ratio.clock), median(ratio.beside, ratio.clock)
        missed += row(ratio.what, time_text(measured), time_text(beside), measured / beside, ratio.most)
    for amount in AMOUNTS:
        value = median(amount.measured, amount.clock) / amount.size
        missed += row(amount.what, f"{value:.1f} {amount.unit}", "", value, amount.most)
    print(f"{missed} goal(s) missed" if missed else "All goals met")
    return 1 if options.check and missed else 0


if __name__ == "__main__":
    sys.exit(main())
