"""The copy of the tree that slips are made in."""

import collections
import os
import re
import subprocess
import sys

from sandbox import hand_over
from schemata import Schemata
from slips import ROOT

PLACE = ROOT / "build" / "mutate"
TREE = PLACE / "tree"
BUILD = TREE / "build" / "release"
HEADER = PLACE / "slip.h"
ERROR = re.compile(r"^(/[^:\n]+|\.\.[^:\n]+):(\d+):\d+: (?:fatal )?error: .*$", re.MULTILINE)


def program(suite):
    """The program of a suite, which may have a filter of tests behind it."""
    name = suite.partition(":")[0]
    found = [path for path in BUILD.rglob(name) if path.is_file() and os.access(path, os.X_OK)]
    if len(found) != 1:
        sys.exit(f"No one program is called {name}.")
    return found[0]


def targets(suites):
    return sorted({suite.partition(":")[0] for suite in suites})


def build(suites, jobs):
    """What the compiler says; nothing where all could be built."""
    made = subprocess.run(
        ["cmake", "--build", BUILD, "-j", str(jobs), "--target", *targets(suites), "--", "-k", "0"],
        capture_output=True, text=True, errors="replace")
    return "" if made.returncode == 0 else made.stdout + made.stderr


def write(path, text):
    """Only what is new, so that little is compiled."""
    data = text if isinstance(text, bytes) else text.encode()
    if not path.exists() or path.read_bytes() != data:
        path.parent.mkdir(parents=True, exist_ok=True)
        path.write_bytes(data)


def copy(generated):
    """The tree as it is now, but for sources that were generated."""
    files = subprocess.run(
        ["git", "ls-files", "-co", "--exclude-standard", "-z"],
        cwd=ROOT, check=True, capture_output=True).stdout.decode().split("\0")
    for name in filter(None, files):
        source, place = ROOT / name, TREE / name
        if not source.is_file():
            place.unlink(missing_ok=True)
        else:
            write(place, generated.get(name) or source.read_bytes())
            place.chmod(source.stat().st_mode & 0o777 | 0o044)
    write(HEADER, (ROOT / "scripts" / "mutate.d" / "slip.h").read_text())
    if not (BUILD / "build.ninja").exists():
        subprocess.run(
            ["cmake", "--preset", "release", "-DZANDOR_WERROR=OFF", "-DZANDOR_EXAMPLES=OFF",
             "-DZANDOR_BENCH=OFF", "-DZANDOR_DESIGNER_PLUGIN=OFF"],
            cwd=TREE, check=True, stdout=subprocess.DEVNULL)


def schemata_of(slips):
    """The sources with the slips in them, by file."""
    files = collections.defaultdict(list)
    for slip in slips:
        files[slip.file].append(slip)
    return {file: Schemata((ROOT / file).read_text(), some, HEADER)
            for file, some in files.items()}


def named(output, sources):
    """The slips that the compiler objects to."""
    found = []
    for path, line in ERROR.findall(output):
        # Paths are as the compiler was given them.
        file = os.path.relpath(os.path.normpath(BUILD / path), TREE)
        if file in sources:
            found += sources[file].at_line(int(line))
    return {slip.key for slip in found}


def prepare(slips, suites, jobs, alone, keep):
    """Builds the tree with the slips in it; `alone` grows by those that have to be tried alone."""
    while True:
        sources = schemata_of([slip for slip in slips if slip.key not in alone])
        copy({file: source.text for file, source in sources.items()})
        print("Building", *targets(suites), flush=True)
        output = build(suites, jobs)
        if not output:
            break
        objections = named(output, sources)
        if not objections:
            # An error elsewhere: in what a source is compiled with.
            objections = {slip.key for slip in slips if pathless(slip.file) in output} - alone
        if not objections - alone:
            sys.exit(output[-3000:])
        alone |= objections
        keep()
    alone |= {slip.key for slip in slips} - set().union(*(source.made for source in sources.values()))
    hand_over(TREE)
    return sources


def pathless(file):
    return file.rpartition("/")[2]
