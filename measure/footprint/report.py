#!/usr/bin/env python3
"""Prints the figures of measure/footprint/README.md, for scripts/footprint.

    report.py BUILD

BUILD is a build directory. After printing, fails if the average event exceeds the limit.
"""

import pathlib
import re
import subprocess
import sys

from elftools.elf.constants import SH_FLAGS
from elftools.elf.elffile import ELFFile

LIMIT = 200  # bytes of text per event on average, without strings and type names
EVENT = re.compile(r"_ZN4bdmv\d+(\w+Event)(8DispatchE|D[02]Ev)")
TABLE = re.compile(r"_ZT[VI]N4bdmv\d+(\w+Event)E$")
TYPE_NAME = re.compile(r"_ZTSN4bdmv\d+(\w+Event)E$")


class Footprint:
    """The sizes in a linked library, in bytes."""

    def __init__(self, path):
        with open(path, "rb") as file:
            elf = ELFFile(file)
            sections = {section.name: section["sh_size"] for section in elf.iter_sections()}
            symbols = {
                symbol.name: symbol["st_size"]
                for symbol in elf.get_section_by_name(".symtab").iter_symbols()
                if not symbol.name.endswith(".localalias")  # a second name of the same code
            }
        self.code_of = by_event(EVENT, symbols)
        self.tables_of = by_event(TABLE, symbols)
        self.name_of = by_event(TYPE_NAME, symbols)

        code = sections[".text"]
        self.events = sum(self.code_of.values())
        self.firing = sum_of(symbols, "EventListenerList_Fire")
        self.rest = code - self.events - self.firing
        self.unwinding = sections[".ARM.extab"] + sections[".ARM.exidx"]
        self.names = sum_of(symbols, "_ZTS")
        self.texts = sections[".rodata"] - self.names - sum_of(symbols, "UO_MASK_TABLE_SIZE")
        self.text = code + self.unwinding + sections[".rodata"]
        self.beyond_strings = self.text - self.texts - self.names
        self.data = sections[".data.rel.ro"] + sections.get(".data", 0)
        self.bss = sections.get(".bss", 0)


class Memory:
    """What a linked file takes once loaded, in bytes."""

    PARTS = (
        ("code", r"\.text"),
        ("strings and type names", r"\.rodata"),
        ("tables for exceptions", r"\.ARM\.ex.*|\.eh_frame"),
        ("virtual tables and type information", r"\.data\.rel\.ro"),
        ("global offset table", r"\.got"),
        ("symbols and their names", r"\.gnu\.(hash|version.*)|\.dyn(sym|str)"),
        ("relocations", r"\.rel\..*"),
        ("stubs for calls of other libraries", r"\.plt"),
        ("everything else", r".*"),
    )

    def __init__(self, path):
        self.parts = dict.fromkeys((title for title, _ in self.PARTS), 0)
        with open(path, "rb") as file:
            for section in ELFFile(file).iter_sections():
                if section["sh_flags"] & SH_FLAGS.SHF_ALLOC:
                    self.parts[self.part_of(section.name)] += section["sh_size"]
        self.total = sum(self.parts.values())

    def part_of(self, name):
        return next(title for title, pattern in self.PARTS if re.fullmatch(pattern, name))


def sum_of(symbols, part):
    return sum(size for name, size in symbols.items() if part in name)


def by_event(pattern, symbols):
    totals = {}
    for name, size in symbols.items():
        match = pattern.match(name)
        if match:
            totals[match[1]] = totals.get(match[1], 0) + size
    return totals


def object_sizes(build, pattern):
    """The total text, data and bss of object files, as counted by the tool `size`."""
    paths = [str(path) for path in pathlib.Path(build).glob(pattern)]
    if not paths:
        sys.exit(f"no {pattern} in {build}")
    lines = subprocess.run(
        ["arm-linux-gnueabihf-size", *paths], check=True, capture_output=True, text=True
    ).stdout.splitlines()[1:]
    return [sum(int(line.split()[column]) for line in lines) for column in range(3)]


def print_row(title, cells):
    print(f"| {title} | " + " | ".join(str(cell) for cell in cells) + " |")


def print_heading(title, columns):
    print_row(title, columns)
    print_row("---", ["---:"] * len(columns))


def print_program(builds, count):
    print(f"All {count} events, in bytes:\n")
    print_heading("the library in a program", ("with log lines", "without"))
    for title, attribute in (
        ("text", "text"),
        ("- code of the events", "events"),
        ("- code that fires callbacks", "firing"),
        ("- code of locks, shared pointers, the log, the mask and helpers", "rest"),
        ("- tables for exceptions", "unwinding"),
        ("- strings of log lines and assertions", "texts"),
        ("- type names", "names"),
        ("data: virtual tables and type information", "data"),
        ("bss", "bss"),
    ):
        print_row(title, [getattr(build, attribute) for build in builds])

    print("\nOne event on average, in bytes:\n")
    print_heading("the library in a program", ("with log lines", "without"))
    for title, attribute in (
        ("text", "text"),
        ("text without strings and type names", "beyond_strings"),
        ("data", "data"),
    ):
        print_row(title, [round(getattr(build, attribute) / count) for build in builds])


def print_memory(archive, shared):
    print("\nAs an archive and as a shared library, in bytes of memory:\n")
    print_heading("the library", ("archive, in a program", "`libbdmvnavigator.so.0`"))
    for title in archive.parts:
        print_row(title, (archive.parts[title], shared.parts[title]))
    print_row("total", (archive.total, shared.total))


def print_objects(directory):
    print("\nObject files before linking, in bytes:\n")
    print_heading("`arm-linux-gnueabihf-size`", ("text", "data", "bss"))
    for title, pattern in (
        ("the library", "CMakeFiles/bdmvnavigator.dir/**/*.o"),
        ("the library without log lines", "**/library_without_log_lines.dir/**/*.o"),
        ("`navigatorevent.cpp`", "CMakeFiles/bdmvnavigator.dir/**/navigatorevent.cpp.o"),
        ("`navigatorevent.cpp`, `-fno-rtti`", "**/events_no_rtti.dir/**/*.o"),
        ("`navigatorevent.cpp`, `-fno-exceptions`", "**/events_no_exceptions.dir/**/*.o"),
    ):
        print_row(title, object_sizes(directory, pattern))


def print_events(full, quiet):
    print("\nPer event, in bytes; the code includes the destructors:\n")
    print_heading("event", ("code", "without log lines", "name", "tables"))
    for name in sorted(full.code_of):
        sizes = (full.code_of, quiet.code_of, full.name_of, full.tables_of)
        print_row(f"`{name}`", [size[name] for size in sizes])


def main():
    directory = sys.argv[1]
    programs = f"{directory}/measure/footprint"
    full = Footprint(f"{programs}/footprint")
    quiet = Footprint(f"{programs}/footprint_without_log_lines")
    count = len(full.code_of)
    print_program((full, quiet), count)
    print_memory(Memory(f"{programs}/footprint"), Memory(f"{programs}/libbdmvnavigator.so"))
    print_objects(directory)
    print_events(full, quiet)
    if full.beyond_strings > LIMIT * count:
        sys.exit(f"an average event has more than {LIMIT} bytes of text without strings and type names")


main()
