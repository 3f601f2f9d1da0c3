"""Compares the SPDX documents of an installation with what is installed and with the sources.

usage: sbom.py --source FOLDER --prefix FOLDER --version VERSION --readelf PROGRAM
"""

import argparse
import json
import re
import shutil
import subprocess
import sys
from pathlib import Path
from urllib.parse import unquote

import jsonschema

# Other names of a dependency: the packages of find_package, and the shared libraries.
DEPENDENCY_OF_PACKAGE = {"Threads": "glibc"}
DEPENDENCY_OF_LIBRARY = {"stdc++": "libstdc++", "c++": "libc++", "gcc_s": "libgcc", "atomic": "libatomic",
                         "c": "glibc", "m": "glibc", "dl": "glibc", "pthread": "glibc", "resolv": "glibc",
                         "rt": "glibc"}
LOADER = re.compile(r"ld(-linux.*|64|)\.so\.\d+$")
SANITIZER = re.compile(r"lib[a-z]+san\.so\.\d+$")

# The sources that an installation may lack, and a file that it then lacks.
OPTIONAL_SOURCES = {"ports": "lib*/libkevro.a", "deskplayer": "bin/bdmv-deskplayer",
                    "cmake": "lib*/libkevro.a"}

faults = []


def expect(condition, fault):
    if not condition:
        faults.append(fault)


class Document:
    def __init__(self, path):
        self.path = path
        self.json = json.loads(path.read_text(encoding="utf-8"))
        schema = json.loads(Path(__file__).with_name("spdx.schema.json").read_text(encoding="utf-8"))
        for error in jsonschema.Draft7Validator(schema).iter_errors(self.json):
            where = "/".join(str(step) for step in error.absolute_path)
            faults.append(f"{path.name}: {where}: {error.message}")
        packages = self.json["packages"]
        self.packages = {package["name"]: package for package in packages}
        self.ids = {package["SPDXID"]: package["name"] for package in packages}
        self.ids[self.json["SPDXID"]] = "DOCUMENT"
        expect(len(self.ids) == len(packages) + 1, f"{path.name}: two packages with one SPDXID")
        self.relationships = set()
        for entry in self.json["relationships"]:
            ends = [entry["spdxElementId"], entry["relatedSpdxElement"]]
            for end in ends:
                expect(end in self.ids, f"{path.name}: a relationship names {end}, which is not in the document")
            source, target = [self.ids.get(end) for end in ends]
            self.relationships.add((source, entry["relationshipType"], target))
        related = {name for source, _, target in self.relationships for name in (source, target)}
        for name in self.packages:
            expect(name in related, f"{path.name}: {name} has no relationship")

    def version(self, name):
        return self.packages.get(name, {}).get("versionInfo")

    def expect_versions_of_packages(self):
        """The version of a dependency is that of the package, for example of Debian, which it is from."""
        for name, package in self.packages.items():
            for reference in package.get("externalRefs", []):
                version = unquote(reference["referenceLocator"].split("?")[0].split("@")[-1]).split(":")[-1]
                expect(re.match(re.escape(package["versionInfo"]) + r"($|[.+~-]|cross)", version),
                       f"{self.path.name}: {name} has the version {package['versionInfo']}, its package {version}")


def find_document(folder, name):
    path = folder / name
    expect(path.is_file(), f"{path} is missing; for the page, run scripts/page")
    return Document(path) if path.is_file() else None


def needed_by(readelf, file):
    output = subprocess.run([readelf, "-dW", file], check=True, capture_output=True, text=True).stdout
    return re.findall(r"\(NEEDED\).*\[(.*)\]", output)


def check_installed_files(document, prefix, version, readelf):
    packages = {package["packageFileName"]: name for name, package in document.packages.items()
                if "packageFileName" in package}
    patterns = ["bin/*", "lib*/**/*.a", "lib*/**/*.so*"]
    files = {file for pattern in patterns for file in prefix.glob(pattern) if not file.is_symlink()}
    expect(files, f"nothing is installed in {prefix}")
    for file in sorted(files):
        name = packages.get(file.name)
        if not name:
            faults.append(f"{document.path.name}: no entry for the installed {file.name}")
            continue
        expect(document.version(name) == version,
               f"{document.path.name}: {name} has the version {document.version(name)}, expected {version}")
        if file.suffix == ".a":
            continue
        for library in needed_by(readelf, file):
            if SANITIZER.match(library):
                continue
            stem = re.sub(r"^lib|\.so.*$", "", library)
            dependency = "glibc" if LOADER.match(library) else DEPENDENCY_OF_LIBRARY.get(stem, stem)
            if stem == "bdmvnavigator":
                dependency = "bdmvnavigator::bdmvnavigator"
            expect((name, "DYNAMIC_LINK", dependency) in document.relationships,
                   f"{document.path.name}: {file.name} needs {library}, but no DYNAMIC_LINK from {name} to "
                   f"{dependency}")


def check_sources(document, source, prefix):
    """Every package that the sources look for has an entry."""
    files = [source / "CMakeLists.txt", *source.glob("cmake/*.in")]
    for folder in ["kits", "ports", "deskplayer"]:
        files += source.glob(f"{folder}/**/CMakeLists.txt")
    found = 0
    for file in files:
        root = file.relative_to(source).parts[0]
        if root in OPTIONAL_SOURCES and not list(prefix.glob(OPTIONAL_SOURCES[root])):
            continue
        for name in re.findall(r"find_(?:package|dependency)\(\s*(\w+)", file.read_text(encoding="utf-8")):
            found += 1
            dependency = DEPENDENCY_OF_PACKAGE.get(name, name)
            expect(dependency in document.packages,
                   f"{document.path.name}: no entry for {name}, which {file.relative_to(source)} looks for")
    expect(found, "the sources look for no package")


def check_page(document, source):
    """The packages of the page are those of the lock file."""
    page = json.loads((source / "page/package.json").read_text(encoding="utf-8"))
    locked = json.loads((source / "page/package-lock.json").read_text(encoding="utf-8"))["packages"]
    for name in page["dependencies"]:
        expect(name in document.packages, f"{document.path.name}: no entry for {name} of page/package.json")
    for name in document.packages:
        if name != page["name"]:
            version = locked.get(f"node_modules/{name}", {}).get("version")
            expect(document.version(name) == version,
                   f"{document.path.name}: {name} has the version {document.version(name)}, "
                   f"in page/package-lock.json {version}")


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--source", type=Path, required=True)
    parser.add_argument("--prefix", type=Path, required=True)
    parser.add_argument("--version", required=True)
    parser.add_argument("--readelf", required=True)
    arguments = parser.parse_args()

    folder = arguments.prefix / "share/bdmvnavigator"
    document = find_document(folder, f"bdmvnavigator-{arguments.version}.spdx.json")
    if document:
        document.expect_versions_of_packages()
        expect("externalRefs" in document.packages.get("glibc", {}) or not shutil.which("dpkg-query"),
               f"{document.path.name}: glibc lacks its Debian package")
        check_installed_files(document, arguments.prefix, arguments.version, arguments.readelf)
        check_sources(document, arguments.source, arguments.prefix)
    if (folder / "timeline.html").exists():
        page = find_document(folder, "timeline.spdx.json")
        if page:
            page.expect_versions_of_packages()
            check_page(page, arguments.source)
    for fault in faults:
        print(fault, file=sys.stderr)
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
