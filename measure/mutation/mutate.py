#!/usr/bin/env python3
"""Breaks the code one change at a time and reports what no test notices.

    scripts/mutate                   every change of the events, a sample of everything else
    scripts/mutate AREA...           only these areas: {areas}
    scripts/mutate --list            the changes, without trying them
    scripts/mutate --match TEXT      only changes whose description contains TEXT
    scripts/mutate --sample N        N changes of each area; all for every one
    scripts/mutate --seed N          another sample
    scripts/mutate --jobs N          N at once; the number of processors unless given

A change drops a statement or swaps it with the next one, inverts a condition, or replaces an operator,
a literal, an argument, an enumerator, a constant or the function that is called. The changed file is
built, and the tests of its area that depend on it are run until one fails. A change that does not
compile is not counted. One that fails no test survives: it is reported, and the exit status is 1, unless
measure/mutation/explained.txt says why no test can notice it. A test that exceeds its time notices
the change too, but is reported: broken code should fail its tests, not hang them.
"""

import argparse
import concurrent.futures
import dataclasses
import functools
import hashlib
import json
import os
import pathlib
import shlex
import subprocess
import sys
import tempfile

import changes

HERE = pathlib.Path(__file__).resolve().parent
ROOT = HERE.parent.parent
BUILD = ROOT / "build/mutation"
EXPLAINED = HERE / "explained.txt"
LEAST_SECONDS = 20  # minimum time limit of a test
SLOWER = 10  # time limit of a test, as a multiple of its time without a change


@dataclasses.dataclass(frozen=True)
class Area:
    """Sources, the folders of their tests, and how many changes to try."""
    name: str
    sources: tuple
    tests: tuple
    sample: int  # None for all


AREAS = (
    Area("events", ("bdmv/bdmvnavigator/*.cpp",), ("tests/bdmv/bdmvnavigator",), None),
    Area("base", ("inc/bd/*.h", "bd/*.cpp"), ("tests/bd",), 40),
    Area("mask", ("bdmv/database/*.cpp", "bdmv/inc/database/uomasktable.h"),
         ("tests/bdmv/database",), 15),
    Area("kits", ("kits/navigatorkit/*.h", "kits/navigatorkit/*.cpp", "kits/clientkit/*.h",
                  "kits/clientkit/*.cpp"), ("tests/kits",), 60),
    Area("port", ("ports/linux/*.h", "ports/linux/*.cpp"), ("tests/ports/linux",), 40),
    Area("deskplayer", ("deskplayer/**/*.h", "deskplayer/**/*.cpp"), ("tests/deskplayer",), 60),
)


def output_of(*command):
    return subprocess.run(command, check=True, capture_output=True, text=True).stdout


# Dependencies, read from the build

def ninja(*arguments):
    return output_of("ninja", "-C", str(BUILD), *arguments).splitlines()


@functools.lru_cache(None)
def inputs_of(targets):
    """All inputs of the targets: sources and intermediate files."""
    return {os.path.normpath(BUILD / line) for line in ninja("-t", "inputs", *targets)}


@functools.lru_cache(None)
def objects_by_header():
    objects, current = {}, None
    for line in ninja("-t", "deps"):
        if line and not line.startswith(" "):
            current = os.path.normpath(BUILD / line.split(": #deps")[0])
        elif line:
            objects.setdefault(os.path.normpath(BUILD / line.strip()), set()).add(current)
    return objects


def tests_in(folder):
    """The tests that CTest knows below a folder of the build."""
    for test in json.loads(output_of("ctest", "--test-dir", str(BUILD / folder),
                                     "--show-only=json-v1"))["tests"]:
        properties = {p["name"]: p["value"] for p in test.get("properties", ())}
        targets = [os.path.relpath(word, BUILD) for word in test["command"]
                   if pathlib.Path(word).is_relative_to(BUILD)]
        yield {"name": test["name"], "command": test["command"], "targets": targets,
               "folder": properties["WORKING_DIRECTORY"],
               "skipped": properties.get("SKIP_RETURN_CODE", 0)}


@functools.lru_cache(None)
def tests_of(area):
    return [test for folder in area.tests for test in tests_in(folder)]


def tests_for(area, file, seconds):
    """The tests of an area that depend on a file: those of the same folder first, then the quick."""
    path = str(ROOT / file)
    dependents = {path} | objects_by_header().get(path, set())
    mirrored = os.path.dirname(BUILD / "tests" / file)
    found = [dict(test, seconds=max(LEAST_SECONDS, SLOWER * seconds[test["name"]]))
             for test in tests_of(area) if dependents & inputs_of(tuple(test["targets"]))]
    return sorted(found, key=lambda test: (test["folder"] != mirrored, seconds[test["name"]]))


# Changes

@functools.lru_cache(None)
def compile_commands():
    entries = json.loads((BUILD / "compile_commands.json").read_text())
    return {entry["file"]: shlex.split(entry["command"]) for entry in entries}


def options_of(area, file):
    """The options for libclang; a header is read with those of all sources of its area."""
    sources = [str(ROOT / file)] if file.endswith(".cpp") else \
        sorted(str(path) for pattern in area.sources for path in ROOT.glob(pattern))
    kept = {}
    for source in sources:
        command = compile_commands().get(source, ())
        for i, word in enumerate(command):
            if word.startswith(("-I", "-D", "-std=")):
                kept[word] = (word,)
            elif word == "-isystem":
                kept[command[i + 1]] = (word, command[i + 1])
    return ["-xc++", *(word for words in kept.values() for word in words)]


def changes_of_file(area, file):
    return changes.changes_of(ROOT / file, file, options_of(area, file))


def in_random_order(found, seed):
    """The same order as long as the changes are the same, whatever else is added or moved."""
    def key(change):
        return hashlib.sha256(f"{seed} {change.what} {change.file}".encode()).digest(), change.begin
    return sorted(found, key=key)


def choose(areas, options):
    """Returns pairs of an area and a change, in the order of the files."""
    tasks = [(area, str(path.relative_to(ROOT))) for area in areas for pattern in area.sources
             for path in sorted(ROOT.glob(pattern))]
    with concurrent.futures.ProcessPoolExecutor(options.jobs) as pool:
        found = list(pool.map(changes_of_file, *zip(*tasks)))
    chosen = []
    for area in areas:
        own = [c for (a, _), listed in zip(tasks, found) if a == area for c in listed
               if options.match in str(c)]
        count = area.sample if options.sample is None else options.sample
        sample = own if count in (None, 0) else in_random_order(own, options.seed)[:count]
        chosen += [(area, c) for c in sorted(sample, key=lambda c: (c.file, c.begin, c.what))]
    return chosen


def explained():
    """The changes that no test can notice, as "FILE: what"."""
    return {line for line in EXPLAINED.read_text().splitlines() if line and line[0] != "#"}


# Attempts

def attempt(file, text, tests):
    """Runs attempt.py isolated from the sources and from other attempts."""
    with tempfile.TemporaryDirectory() as scratch:
        command = ["unshare", "--mount", "--pid", "--fork", "--kill-child", "--mount-proc"]
        if os.geteuid() != 0:
            command.insert(1, "--map-root-user")
        change = {"file": file and str(ROOT / file), "text": text, "tests": tests}
        ended = subprocess.run([*command, sys.executable, str(HERE / "attempt.py"), str(ROOT),
                                str(BUILD), scratch], input=json.dumps(change),
                               capture_output=True, text=True)
    if ended.returncode != 0:
        raise RuntimeError(f"cannot try a change: {ended.stderr}")
    return json.loads(ended.stdout)


def seconds_without_change(area):
    """How long each test of an area takes. All must pass."""
    result = attempt("", "", [dict(test, seconds=600) for test in tests_of(area)])
    if result["result"] != "survived":
        sys.exit(f"mutate: {result.get('by', area.name)} fails without a change")
    return result["seconds"]


def try_change(area, change, seconds):
    source = change.applied_to((ROOT / change.file).read_bytes()).decode()
    text = f'#include "{HERE / "mutated.h"}"\n#line 1 "{ROOT / change.file}"\n{source}'
    return attempt(change.file, text, tests_for(area, change.file, seconds))


def report(counts):
    noticed = f"{counts['noticed'] + counts['timed out']} changes noticed"
    if counts["timed out"]:
        noticed += f" ({counts['timed out']} by a test that timed out)"
    return (f"{noticed}, {counts['survived']} survived, {counts['explained']} cannot be noticed, "
            f"{counts['unbuildable']} did not compile")


def main():
    names = [area.name for area in AREAS]
    parser = argparse.ArgumentParser(prog="scripts/mutate",
                                     description=__doc__.format(areas=", ".join(names)),
                                     formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("areas", nargs="*", metavar="AREA")
    parser.add_argument("--list", action="store_true")
    parser.add_argument("--match", default="", metavar="TEXT")
    parser.add_argument("--sample", metavar="N", type=lambda n: 0 if n == "all" else int(n))
    parser.add_argument("--seed", type=int, default=1, metavar="N")
    parser.add_argument("--jobs", type=int, default=os.cpu_count(), metavar="N")
    options = parser.parse_args()
    for name in options.areas:
        if name not in names:
            parser.error(f"unknown area '{name}'; expected {', '.join(names)}")
    areas = [area for area in AREAS if not options.areas or area.name in options.areas]

    chosen = choose(areas, options)
    if options.list:
        print("\n".join(str(change) for _, change in chosen))
        return 0
    ninja(*(f"{folder}/all" for area in areas for folder in area.tests))
    seconds = {}
    for area in areas:
        seconds.update(seconds_without_change(area))
    known = explained()
    totals = {}
    with concurrent.futures.ThreadPoolExecutor(options.jobs) as pool:
        results = pool.map(lambda pair: try_change(*pair, seconds), chosen)
        for done, ((area, change), result) in enumerate(zip(chosen, results), 1):
            outcome = result["result"]
            if outcome == "survived" and f"{change.file}: {change.what}" in known:
                outcome = "explained"
            counts = totals.setdefault(area.name, dict.fromkeys(
                ("unbuildable", "noticed", "timed out", "survived", "explained"), 0))
            counts[outcome] += 1
            if outcome in ("survived", "timed out"):
                by = f" ({result['by']})" if "by" in result else ""
                print(f"{outcome}: {change}{by}", flush=True)
            if sys.stderr.isatty():
                print(f"\r{done} of {len(chosen)}", end="", file=sys.stderr, flush=True)
    if sys.stderr.isatty():
        print(file=sys.stderr)
    for name, counts in totals.items():
        print(f"{name}: {report(counts)}")
    return 1 if any(counts["survived"] for counts in totals.values()) else 0


if __name__ == "__main__":
    sys.exit(main())
