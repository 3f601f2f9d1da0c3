#!/usr/bin/env python3
"""Tries one change and prints the outcome; mutate.py runs it in separate namespaces.

    attempt.py ROOT BUILD SCRATCH <CHANGE

CHANGE is JSON: a file and its changed text, the tests to run and their limits. SCRATCH is an empty
folder. Source and build are changed in an overlay, which vanishes with the process, as do the
processes that a test leaves.
"""

import json
import os
import pathlib
import resource
import subprocess
import sys
import time

FILE_BYTES = 64 << 20  # of each file that a test writes
SCRATCH_BYTES = 1 << 30  # of all files, build results included
MEMORY_BYTES = 4 << 30  # of address space


def mount_overlay(root, scratch):
    """Redirects all later writes below ROOT to memory."""
    subprocess.run(["mount", "-t", "tmpfs", "-o", f"size={SCRATCH_BYTES}", "tmpfs", scratch],
                   check=True)
    for name in ("upper", "work", "temporary"):
        os.mkdir(f"{scratch}/{name}")
    options = f"lowerdir={root},upperdir={scratch}/upper,workdir={scratch}/work"
    subprocess.run(["mount", "-t", "overlay", "-o", options, "overlay", root], check=True)


def limit():
    # Tests that make sparse files raise the soft limit; the size of the scratch folder still holds.
    resource.setrlimit(resource.RLIMIT_FSIZE, (FILE_BYTES, resource.RLIM_INFINITY))
    resource.setrlimit(resource.RLIMIT_AS, (MEMORY_BYTES, MEMORY_BYTES))
    resource.setrlimit(resource.RLIMIT_CORE, (0, 0))


def builds(build, targets):
    return subprocess.run(["ninja", "-C", build, "-j1", *targets],
                          stdout=subprocess.DEVNULL).returncode == 0


def run(test, scratch):
    """Returns "passed", "failed" or "timed out"."""
    environment = {**os.environ, "TMPDIR": f"{scratch}/temporary",
                   "TEST_TMPDIR": f"{scratch}/temporary", "GTEST_FAIL_FAST": "1",
                   "GTEST_BRIEF": "1"}
    try:
        ended = subprocess.run(test["command"], cwd=test["folder"], env=environment,
                               stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL,
                               stderr=subprocess.DEVNULL, preexec_fn=limit,
                               timeout=test["seconds"])
    except subprocess.TimeoutExpired:
        return "timed out"
    return "passed" if ended.returncode in (0, test["skipped"]) else "failed"


def attempt(change, build, scratch):
    """Returns the outcome of the change and, if a test failed or timed out, its name."""
    if change["file"]:
        pathlib.Path(change["file"]).write_text(change["text"])
    if change["file"].endswith(".cpp") and not builds(build, [change["file"] + "^"]):
        return {"result": "unbuildable"}
    seconds = {}
    for test in change["tests"]:
        if not builds(build, test["targets"]):
            return {"result": "unbuildable"}
        begin = time.monotonic()
        result = run(test, scratch)
        if result != "passed":
            return {"result": "noticed" if result == "failed" else result, "by": test["name"]}
        seconds[test["name"]] = time.monotonic() - begin
    return {"result": "survived", "seconds": seconds}


def main():
    root, build, scratch = sys.argv[1:]
    change = json.load(sys.stdin)
    mount_overlay(root, scratch)
    os.chdir(root)
    output = os.dup(sys.stdout.fileno())
    os.dup2(os.open(os.devnull, os.O_WRONLY), sys.stdout.fileno())
    os.write(output, json.dumps(attempt(change, build, scratch)).encode())


if __name__ == "__main__":
    main()
