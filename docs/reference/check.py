#!/usr/bin/env python3
"""Checks the API reference for scripts/docs and prints what is wrong with it.

    check.py INSTALLED TAGFILE HTML

INSTALLED is the folder of the installed headers, TAGFILE Doxygen's list of what it documented, HTML
the folder of its pages. The reference must have a page for every installed header and no other, and
every link within it must lead to an existing page and place.
"""

import sys
import xml.etree.ElementTree as ElementTree
from html.parser import HTMLParser
from pathlib import Path
from urllib.parse import unquote, urlsplit

# Doxygen's link to the list of nested classes, which it omits if all of them are private.
NESTED_CLASSES = "#nested-classes"


class Page(HTMLParser):
    """The links of a page and the places that it has."""

    def __init__(self, path):
        super().__init__()
        self.links = []
        self.places = {""}
        self.feed(path.read_text(encoding="utf-8"))

    def handle_starttag(self, tag, attrs):
        for name, value in attrs:
            if value and (name == "id" or (tag == "a" and name == "name")):
                self.places.add(value)
            elif value and name in ("href", "src"):
                self.links.append(value)


def documented_headers(tagfile, html):
    """The paths of the headers that have a page."""
    for file in ElementTree.parse(tagfile).iterfind("compound[@kind='file']"):
        name = file.findtext("name")
        if name.endswith(".h") and (html / file.findtext("filename")).exists():
            yield file.findtext("path") + name


def header_faults(installed, tagfile, html):
    names = sorted(str(path.relative_to(installed)) for path in installed.rglob("*.h"))
    if not names:
        yield f"no headers in {installed}"
    documented = list(documented_headers(tagfile, html))
    for name in names:
        if not any(path.endswith("/" + name) for path in documented):
            yield f"{name} is installed, but is not in the reference"
    for path in documented:
        if not any(path.endswith("/" + name) for name in names):
            yield f"{path} is in the reference, but is not installed"


def link_faults(html):
    pages = {path.name: Page(path) for path in html.glob("*.html")}
    for name, page in sorted(pages.items()):
        for link in sorted(set(page.links)):
            target = urlsplit(link)
            if target.scheme or link == NESTED_CLASSES:
                continue
            linked = unquote(target.path) or name
            if not (html / linked).exists():
                yield f"{name} links to {link}, which does not exist"
            elif linked in pages and unquote(target.fragment) not in pages[linked].places:
                yield f"{name} links to {link}, but {linked} has no such place"


def main():
    installed, tagfile, html = map(Path, sys.argv[1:])
    faults = [*header_faults(installed, tagfile, html), *link_faults(html)]
    print("\n".join(faults), end="\n" if faults else "")
    return 1 if faults else 0


sys.exit(main())
