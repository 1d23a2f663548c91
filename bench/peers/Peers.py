#!/usr/bin/env python3
"""Runs the same form in several toolkits and prints medians, and how ours compares.

    Peers.py [--check] [--record FILE] --rounds N --server PID DIRECTORY

The programs of the directory take turns at each thing that is measured, so that all meet the same conditions, and
another one begins in each round: whoever comes first finds a server that has rested. With --check the exit status is 1
when a goal is missed. With --record the table is written to a document too, with what it was measured on.
"""
import argparse
import contextlib
import io
import os
import statistics
import subprocess
import sys
from collections import namedtuple

OURS = "glog"
OURS_IN_PANES = "panes"  # a pane for each check box: shown below the others, and without a goal
PEERS = ("qt", "fltk", "gtk")
FEW_BOXES, MANY_BOXES = 400, 1600
NOTIFY_WAYS = ("qt", "gtk", "boost", "sigc", "fltk", "virtual")  # to tell listeners, beside ours
LONGEST_RUN_SECONDS = 120

# Goals are for our value over a peer's.
AHEAD = {"qt": 1, "fltk": 1, "gtk": 1}
# FLTK neither measures its labels when the form is made nor follows the mouse for as long.
AHEAD_OR_NEAR = {"qt": 1, "fltk": 3, "gtk": 1}

Row = namedtuple("Row", "what name unit size goals", defaults=({},))
ROWS = (
    Row("full repaint", "repaint", "us", 1e3, AHEAD),
    Row("full repaint in memory", "repaint-offscreen", "us", 1e3, AHEAD),
    Row("toggle with its repaint", "toggle", "us", 1e3, AHEAD),
    Row("build of the form", "build", "us", 1e3, AHEAD_OR_NEAR),
    Row("click to listener", "click", "us", 1e3, AHEAD_OR_NEAR),
    Row("memory of a check box", "memory", "B", 1, AHEAD_OR_NEAR),
    Row("list scrolled by 10 pixels", "scroll-step", "us", 1e3, AHEAD),
    Row("million rows: full repaint", "table-repaint", "us", 1e3, AHEAD),
    Row("million rows: down by one", "table-step", "us", 1e3, AHEAD),
    Row("million rows: to another", "table-jump", "us", 1e3, AHEAD),
    Row("million rows: click", "table-click", "us", 1e3, AHEAD),
    Row("million rows: first frame", "table-first-frame", "us", 1e3, AHEAD),
    Row("40 tabs in another width", "tabs-width", "us", 1e3, AHEAD),
    Row("10,000 lines: one letter typed", "text-type", "us", 1e3, AHEAD),
    Row("start of the process", "start", "us", 1e3, AHEAD_OR_NEAR),
    Row("first build of the program", "first-build", "us", 1e3),
    Row("first build and frame", "first-frame", "us", 1e3),
)

NOTIFY_LISTENERS = (1, 10, 1000)
# A message has to be ahead of these. The others are only shown: libsigc++ calls what is half destroyed, a callback of FLTK
# and a bare virtual call keep no list, or none that may change meanwhile.
NOTIFY_AHEAD = ("qt", "gtk", "boost")


def measure(program, *arguments):
    """What one run of the program prints: values by name, in the order of their printing."""
    run = subprocess.run([program, *map(str, arguments)], stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True,
                         timeout=LONGEST_RUN_SECONDS, check=False)
    if run.returncode != 0:
        sys.exit(f"{program} ended with status {run.returncode}\n{run.stderr}")
    values = {}
    for line in run.stdout.splitlines():
        name, value = line.split()
        values.setdefault(name, []).append(int(value))
    return values


def take_turns(values, programs, *arguments):
    """Runs the programs, a dictionary by name, one after the other with the same arguments."""
    for name, program in programs.items():
        for what, measured in measure(program, *arguments).items():
            # The median of a run counts once, so that no run counts for more than another.
            values.setdefault((name, what), []).append(statistics.median(measured))


def run_round(directory, peers, server, values):
    programs = {peer: os.path.join(directory, f"peer_{peer}") for peer in peers}
    for what in ("window", "offscreen", "list", "table", "tabs", "text"):
        take_turns(values, programs, what, server)
    for boxes in (FEW_BOXES, MANY_BOXES):
        take_turns(values, programs, "memory", boxes)
    for peer in peers:
        few, many = (values[peer, f"resident-{boxes}"][-1] for boxes in (FEW_BOXES, MANY_BOXES))
        values.setdefault((peer, "memory"), []).append((many - few) / (MANY_BOXES - FEW_BOXES))


def print_notifications(medians):
    """Prints what a message costs by the number of listeners; how many goals are missed."""
    missed = 0
    print("message to listeners, ns".ljust(31) + "".join(f"{way:>11}" for way in (OURS,) + NOTIFY_WAYS))
    for listeners in NOTIFY_LISTENERS:
        ours = medians[OURS, f"notify-{listeners}"]
        figures, ratios = f"{ours / 1e3:11.1f}", " " * 11
        for way in NOTIFY_WAYS:
            theirs = medians.get((way, f"notify-{listeners}"))
            figures += f"{theirs / 1e3:11.1f}" if theirs else f"{'-':>11}"
            over = theirs and way in NOTIFY_AHEAD and ours > theirs
            missed += bool(over)
            ratios += f"{ours / theirs:6.2f}{' over' if over else '':5}" if theirs else f"{'-':>11}"
        print(f"{listeners:<31,}{figures}\n{'  ours / theirs':31}{ratios}".rstrip())
    return missed


def print_heading(ours):
    print((f"{'':31}" + "".join(f"{peer:>11}" for peer in (ours,) + PEERS) +
           "".join(f"   {ours + ' / ' + peer:15}" for peer in PEERS)).rstrip())


def print_row(row, medians, ours=OURS):
    """Prints a line; how many of its goals are missed."""
    missed = 0
    line = f"{row.what:31}"
    for peer in (ours,) + PEERS:
        line += f"{medians[peer, row.name] / row.size:8.0f} {row.unit:2}"
    for peer in PEERS:
        ratio = medians[ours, row.name] / medians[peer, row.name]
        mark = ""
        if peer in row.goals:
            met = ratio <= row.goals[peer]
            mark = f" of {row.goals[peer]} " + ("PASS" if met else "over")
            missed += not met
        line += f"  {ratio:6.2f}{mark:10}"
    print(line.rstrip())
    return missed


def output_of(*command):
    try:
        return subprocess.run(command, stdout=subprocess.PIPE, stderr=subprocess.STDOUT, text=True, check=True).stdout
    except (OSError, subprocess.CalledProcessError):
        return ""


def first_line(text, start):
    return next((line[len(start):].lstrip(" \t:=").strip('"') for line in text.splitlines() if line.startswith(start)), "?")


def conditions(rounds):
    """What the figures hold for, as lines of a document."""
    processor = first_line(output_of("cat", "/proc/cpuinfo"), "model name")
    system = first_line(output_of("cat", "/etc/os-release"), "PRETTY_NAME")
    versions = {"Qt": output_of("pkg-config", "--modversion", "Qt6Widgets"),
                "FLTK": output_of("fltk-config", "--version"),
                "GTK": output_of("pkg-config", "--modversion", "gtk4"),
                "SDL": output_of("pkg-config", "--modversion", "sdl2"),
                "Cairo": output_of("pkg-config", "--modversion", "cairo"),
                "Pango": output_of("pkg-config", "--modversion", "pango"),
                "g++": output_of("g++", "-dumpfullversion"),
                "libsigc++": output_of("pkg-config", "--modversion", "sigc++-3.0"),
                "Boost": output_of("dpkg-query", "-W", "-f", "${Version}", "libboost-dev"),
                "X server": output_of("dpkg-query", "-W", "-f", "${Version}", "xvfb")}
    named = ", ".join(f"{name} {version.strip() or '?'}" for name, version in versions.items())
    return [f"- {os.cpu_count()} processors: {processor}", f"- {system}", f"- {named}",
            f"- medians of {rounds} rounds"]


def write_record(path, table, rounds):
    lines = ["# How the panes compare", "",
             "What `bench/peers/run --record` measured; `bench/peers/README.md` says how, and what is not comparable.",
             "A goal is for our figure divided by the other's.", "", *conditions(rounds), "", "```", table.rstrip(),
             "```", ""]
    with open(path, "w", encoding="utf-8") as file:
        file.write("\n".join(lines))


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--check", action="store_true")
    parser.add_argument("--record")
    parser.add_argument("--rounds", type=int, required=True)
    parser.add_argument("--server", type=int, required=True)
    parser.add_argument("directory")
    options = parser.parse_args()

    values = {}
    peers = [OURS, OURS_IN_PANES, *PEERS]
    for _ in range(options.rounds):
        run_round(options.directory, peers, options.server, values)
        take_turns(values, {way: os.path.join(options.directory, f"notify_{way}") for way in (OURS, *NOTIFY_WAYS)})
        peers.append(peers.pop(0))
    medians = {key: statistics.median(measured) for key, measured in values.items()}

    table = io.StringIO()
    with contextlib.redirect_stdout(table):
        print_heading(OURS)
        missed = sum(print_row(row, medians) for row in ROWS)
        print()
        missed += print_notifications(medians)
        print()
        print_heading(OURS_IN_PANES)
        for row in ROWS:
            print_row(row._replace(goals={}), medians, OURS_IN_PANES)
        print()
        print(f"{missed} goal(s) missed" if missed else "All goals met")
    print(table.getvalue(), end="")
    if options.record:
        write_record(options.record, table.getvalue(), options.rounds)
    return 1 if options.check and missed else 0


if __name__ == "__main__":
    sys.exit(main())
