"""Doxygen reads every document through this: it gives each heading an identifier that is unique
among all documents, and makes links to headings use it. Line numbers do not change."""

import collections
import os
import re
import sys


def identifier(document, fragment):
    return os.path.splitext(os.path.basename(document))[0].lower() + "-" + fragment


def fragment_of(heading):
    """The fragment by which links in the repository name a heading."""
    return re.sub(r"[^\w\- ]", "", heading.lower()).replace(" ", "-")


def with_identifiers(document):
    def link(match):
        target, fragment = match.groups()
        return f"](#{identifier(target or document, fragment)})"

    in_code = False
    uses = collections.Counter()
    with open(document, encoding="utf-8") as lines:
        for line in lines:
            in_code ^= line.startswith("```")
            heading = re.match(r"(#{2,6}) (.+)\n", line)
            if heading and not in_code:
                fragment = fragment_of(heading[2])
                number = f"-{uses[fragment]}" if uses[fragment] else ""
                uses[fragment] += 1
                yield f"{line.rstrip()} {{#{identifier(document, fragment)}{number}}}\n"
            else:
                yield re.sub(r"\]\(([\w./]*)#([\w-]+)\)", link, line)


sys.stdout.writelines(with_identifiers(sys.argv[1]))
