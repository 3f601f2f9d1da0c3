#!/usr/bin/env python3
"""Measures how fast the desk player reads a log, for scripts/fieldlog.

    measure.py DESKPLAYER FOLDER MIB

Makes a log of MIB mebibytes in FOLDER, unless it is there, and prints a table.
"""

import os
import pathlib
import platform
import statistics
import subprocess
import sys
import time

ROUNDS = 5
DISC = "examples/discs/sample"

# An evening, again and again. Some commands are refused: their messages are foreign lines too.
EVENING = """\
after 3s play
after 9s audio 2
after 1s audio 1
after 15s pause
after 20s step
after 2s continue
after 10s chapter previous
after 5s pip on
after 10s pip off
after 10s forward fast 2
after 5s forward
after 60s stop
"""

# What other components write between the lines of events.
FOREIGN = [
    "00:00:00.000000 BdmvSystem State: buffer 42 % full",
    "May 31 20:15:04 box kernel: usb 1-1: new high-speed USB device number 4",
    "2024-05-31 20:15:00.123456 Reader Warning: sector 1234567: retry 1 of 5",
    "2024-05-31T20:15:00.123456+02:00 box dhclient[311]: bound to 192.0.2.17, renewal in 1780 s",
    "    at decoder.cpp:118, called from demultiplexer.cpp:2041",
]


class Run:
    """A program that has ended."""

    def __init__(self, command, environment, output):
        begin = time.monotonic()
        with open(output, "wb") as file:
            process = subprocess.Popen(
                command, env=environment, stdout=file, stderr=subprocess.DEVNULL
            )
            _, status, usage = os.wait4(process.pid, 0)
        self.elapsed = time.monotonic() - begin
        self.processor = usage.ru_utime + usage.ru_stime
        if status != 0:
            sys.exit(f"measure.py: failed: {' '.join(command)}")


def make_log(player, log, size):
    """Writes the log of a session, again and again, with foreign lines in between."""
    session = log.with_name("session")
    session.write_text(1000 * EVENING)
    command = [player, DISC, "--session", session, "--output", os.devnull]
    lines = subprocess.run(
        [*command, "--log", "BdmvNavigator=Event+hifreq|Warning"],
        stderr=subprocess.PIPE, check=True,
    ).stderr.splitlines(keepends=True)
    part = bytearray()
    for number, line in enumerate(lines):
        part += line
        if number % 2 == 1:
            part += FOREIGN[number // 2 % len(FOREIGN)].encode() + b"\n"
    with open(log, "wb") as file:
        while file.tell() < size:
            rest = part[: size - file.tell()]
            file.write(rest[: rest.rindex(b"\n") + 1])
            if len(rest) < len(part):
                break


def processor_name():
    for line in pathlib.Path("/proc/cpuinfo").read_text().splitlines():
        if line.startswith("model name"):
            return line.partition(": ")[2]
    return platform.machine()


def load():
    return " ".join(pathlib.Path("/proc/loadavg").read_text().split()[:3])


def main():
    player, folder, mebibytes = sys.argv[1], pathlib.Path(sys.argv[2]), int(sys.argv[3])
    log = folder / f"log.{mebibytes}"
    if not log.exists():
        make_log(player, log.with_name("unfinished"), mebibytes << 20)
        log.with_name("unfinished").rename(log)

    # Without more memory than this, a program that needs it fails.
    read = ["prlimit", f"--as={64 << 20}", player, "--field-log", str(log)]
    programs = {
        # It would stop at the first match if its output were /dev/null.
        "grep -c Sending": (["grep", "-c", "Sending", str(log)], None),
        "--summary": ([*read, "--summary"], 6),
        "--format json": ([*read, "--format", "json"], 25),
    }
    environment = {**os.environ, "LC_ALL": "C"}
    before = load()
    runs = {name: [] for name in programs}
    log.read_bytes()  # into the system's cache
    for _ in range(ROUNDS):
        for name, (command, goal) in programs.items():
            output = os.devnull if goal else log.with_name("count")
            runs[name].append(Run(command, environment, output))

    def median(name, value):
        return statistics.median(getattr(run, value) for run in runs[name])

    content = subprocess.run(["wc", "-l", log], stdout=subprocess.PIPE, check=True).stdout
    print(processor_name())
    print(f"{os.cpu_count()} processors, {platform.system()} {platform.release()}")
    print(f"Load average before: {before}")
    print(f"\nA log of {log.stat().st_size / (1 << 20):.0f} MiB, {content.split()[0].decode()} lines:"
          f" medians of {ROUNDS} rounds")
    print(f"  {'':18}{'s':>8}{'× grep':>9}{'CPU s':>9}{'× grep':>9}")
    goals = []
    for name, (_, goal) in programs.items():
        elapsed, processor = median(name, "elapsed"), median(name, "processor")
        ratio = elapsed / median("grep -c Sending", "elapsed")
        processor_ratio = processor / median("grep -c Sending", "processor")
        print(f"  {name:18}{elapsed:8.2f}{ratio:9.2f}{processor:9.2f}{processor_ratio:9.2f}")
        if goal:
            met = "met" if ratio <= goal else "MISSED"
            goals.append(f"  {met:8}{name}, × grep (within {goal}, {ratio:.2f})")
    print("\nGoals\n" + "\n".join(goals))
    print(f"\nLoad average afterwards: {load()}")


main()
