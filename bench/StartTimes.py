#!/usr/bin/env python3
"""Times the start of programs that report their first frame, and looks at one of them while it is idle.

    StartTimes.py --runs N --idle SECONDS --out FILE PROGRAM BARE_PROGRAM

The programs take turns, so that both meet the same conditions. Writes the same form of file as the other benchmarks.
"""
import argparse
import json
import os
import signal
import sys
import time

SETTLING_SECONDS = 2.0
LONGEST_START_SECONDS = 30
KILOBYTE = 1024


class Started:
    """A program that has shown its first frame, with the nanoseconds that took: by the clock and of the processor."""

    def __init__(self, program):
        reader, writer = os.pipe()
        begun = time.clock_gettime_ns(time.CLOCK_MONOTONIC)
        self.pid = os.posix_spawn(program, [program], os.environ, file_actions=[
            (os.POSIX_SPAWN_DUP2, writer, 1), (os.POSIX_SPAWN_CLOSE, reader), (os.POSIX_SPAWN_CLOSE, writer)])
        os.close(writer)
        with os.fdopen(reader) as report:
            signal.alarm(LONGEST_START_SECONDS)
            line = report.readline()
            signal.alarm(0)
        if not line:
            _, status = os.waitpid(self.pid, 0)
            sys.exit(f"{program} ended without a frame (status {os.waitstatus_to_exitcode(status)})")
        shown, self.processor = map(int, line.split())
        self.clock = shown - begun

    def status(self, field):
        with open(f"/proc/{self.pid}/status", encoding="utf-8") as file:
            for line in file:
                if line.startswith(field + ":"):
                    return int(line.split()[1])
        raise KeyError(field)

    def wakeups(self):
        """How often threads of the process have waited so far."""
        total = 0
        for thread in os.listdir(f"/proc/{self.pid}/task"):
            with open(f"/proc/{self.pid}/task/{thread}/status", encoding="utf-8") as file:
                total += sum(int(line.split()[1]) for line in file if line.startswith("voluntary_ctxt_switches"))
        return total

    def end(self):
        os.kill(self.pid, signal.SIGTERM)
        signal.alarm(LONGEST_START_SECONDS)
        _, status = os.waitpid(self.pid, 0)
        signal.alarm(0)
        if os.waitstatus_to_exitcode(status) != 0:
            sys.exit(f"the program ended with status {os.waitstatus_to_exitcode(status)}")


def entry(name, clock, processor, unit):
    return {"name": name, "run_type": "iteration", "real_time": clock, "cpu_time": processor, "time_unit": unit}


def time_starts(programs, runs):
    entries = []
    for number in range(runs + 1):
        for name, program in programs:
            started = Started(program)
            if number > 0:  # the first run fetches the files from the disk
                entries.append(entry(name, started.clock, started.processor, "ns"))
            started.end()
    return entries


def watch_idle(program, seconds):
    started = Started(program)
    time.sleep(SETTLING_SECONDS)
    before = started.wakeups()
    time.sleep(seconds)
    wakeups = started.wakeups() - before
    resident = started.status("VmRSS") * KILOBYTE
    started.end()
    return [entry("Idle/wake-ups", wakeups, wakeups, "count"), entry("Idle/resident", resident, resident, "bytes")]


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--runs", type=int, required=True)
    parser.add_argument("--idle", type=float, required=True)
    parser.add_argument("--out", required=True)
    parser.add_argument("program")
    parser.add_argument("bare_program")
    options = parser.parse_args()
    entries = time_starts((("Start/ours", options.program), ("Start/bare", options.bare_program)), options.runs)
    entries += watch_idle(options.program, options.idle)
    with open(options.out, "w", encoding="utf-8") as file:
        json.dump({"benchmarks": entries}, file, indent=1)


if __name__ == "__main__":
    main()
