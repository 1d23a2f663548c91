#!/usr/bin/env python3
"""Counts the instructions of an operation, and compares them with its limit.

    check_limit.py PROGRAM OPERATION LIMITS

LIMITS is a file with a line for each operation: its name and the most instructions that one may take. Too few are a
failure as well: a limit that is far away finds nothing, and is to be lowered.
"""
import os
import re
import subprocess
import sys
import tempfile

TIMES = 20
LEAST_SHARE = 0.5  # of the limit


def limits(path):
    with open(path, encoding="utf-8") as file:
        lines = (line.split("#")[0].split() for line in file)
        return {words[0]: int(words[1].replace(",", "")) for words in lines if words}


def count(program, operation):
    with tempfile.TemporaryDirectory() as scratch:
        run = subprocess.run(
            ["valgrind", "--tool=callgrind", "--collect-atstart=no", "--toggle-collect=Measured(*",
             "--callgrind-out-file=" + os.path.join(scratch, "out"), program, operation, str(TIMES)],
            stdout=subprocess.PIPE, stderr=subprocess.STDOUT, text=True, check=False)
    collected = re.search(r"Collected : (\d+)", run.stdout)
    if run.returncode != 0 or not collected or int(collected.group(1)) == 0:
        sys.exit(f"{program} {operation} has not been counted\n{run.stdout}")
    return int(collected.group(1)) // TIMES


def main():
    if len(sys.argv) != 4:
        sys.exit(__doc__)
    program, operation, path = sys.argv[1:]
    limit = limits(path).get(operation)
    if limit is None:
        sys.exit(f"{path} has no limit for {operation}")
    counted = count(program, operation)
    print(f"{operation}: {counted:,} instructions, limit {limit:,}")
    if counted > limit:
        sys.exit(f"{operation} takes more instructions than it may")
    if counted < limit * LEAST_SHARE:
        sys.exit(f"the limit of {operation} is to be lowered")


if __name__ == "__main__":
    main()
