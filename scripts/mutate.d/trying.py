"""Trying slips, and what is known of them."""

import concurrent.futures
import json
import queue
import sys
import time

from sandbox import Sandbox, hand_over
from slips import ROOT
from tree import BUILD, PLACE, TREE, prepare, program, targets

KNOWN = PLACE / "known.json"
ALONE = PLACE / "alone.json"
LOST = ("survived", "stale")


class Results:
    """Verdicts by slip, kept in a file; which slips cannot be chosen in one build, in another."""

    def __init__(self):
        self.known = json.loads(KNOWN.read_text()) if KNOWN.exists() else {}
        self.alone = set(json.loads(ALONE.read_text())) if ALONE.exists() else set()

    def keep(self):
        KNOWN.write_text(json.dumps(self.known, indent=0))
        ALONE.write_text(json.dumps(sorted(self.alone)))

    def survived(self, slip):
        return self.known.get(slip.key, [""])[0] in LOST

    def forget(self, slip):
        self.known.pop(slip.key, None)

    def say(self, slips):
        counts = {}
        for slip in slips:
            verdict = "equivalent" if slip.reason else self.known.get(slip.key, ["untried"])[0]
            counts[verdict] = counts.get(verdict, 0) + 1
            if verdict in LOST:
                words = self.known[slip.key][1]
                print(f"{verdict}: {slip.name} in {slip.file}: {slip.notice}"
                      f"{f' ({words})' if words else ''}")
        tried = counts.get("killed", 0) + counts.get("survived", 0)
        print(", ".join(f"{count} {verdict}" for verdict, count in sorted(counts.items())))
        if tried:
            print(f"{100 * counts.get('killed', 0) / tried:.1f} % of {tried} were noticed")
        return 1 if any(counts.get(verdict) for verdict in LOST) else 0


def failure(sandbox, suite, limit, number=0):
    """What fails in a suite first; nothing where all of it passes."""
    _, _, tests = suite.partition(":")
    output, passed = sandbox.run(
        [program(suite), "--gtest_fail_fast", "--gtest_brief=1", f"--gtest_filter={tests or '*'}"],
        limit, ZANDOR_SLIP=str(number))
    if passed:
        return None
    failed = [line for line in output.splitlines() if "[  FAILED  ]" in line]
    return failed[0].split("]", 1)[1].strip() if failed else output.strip()[-100:]


def reached(sandbox, suite, limit):
    """The numbers of the slips that a suite comes by; it has to pass without one."""
    words = failure(sandbox, suite, limit)
    if words is not None:
        sys.exit(f"{suite} fails without any slip: {words}")
    _, _, tests = suite.partition(":")
    place = PLACE / "reached"
    place.write_text("")
    hand_over(place)
    sandbox.run([program(suite), "--gtest_brief=1", f"--gtest_filter={tests or '*'}"], 4 * limit,
                ZANDOR_SLIP="-1", ZANDOR_REACHED=str(place))
    return {int(line) for line in place.read_text().split()}


def chosen_verdict(sandbox, slip, reaching, limit):
    came = False
    for suite in slip.suites:
        if slip.choice in reaching[suite]:
            came = True
            words = failure(sandbox, suite, limit, slip.choice)
            if words is not None:
                return "killed", f"{suite}: {words}"
    return "survived", "" if came else "no test comes by"


def alone_verdict(sandbox, slip, limit, jobs):
    path = TREE / slip.file
    before = path.read_text()
    mutant = slip.applied((ROOT / slip.file).read_text())
    if mutant is None:
        return "stale", "its old text has no place, or several"
    path.write_text(mutant)  # in its place, so that whoever owns it does
    try:
        for suite in slip.suites:
            output, built = sandbox.run(
                ["cmake", "--build", BUILD, "-j", jobs, "--target", *targets([suite])],
                10 * limit, memory=-1)
            if not built:
                return "uncompiled", output.splitlines()[-1] if output else ""
            words = failure(sandbox, suite, limit)
            if words is not None:
                return "killed", f"{suite}: {words}"
        return "survived", ""
    finally:
        path.write_text(before)


def try_all(slips, results, limit, jobs):
    real = [slip for slip in slips if not slip.reason]
    wanted = [slip for slip in real if slip.key not in results.known]
    if not wanted:
        return
    suites = list(dict.fromkeys(suite for slip in wanted for suite in slip.suites))
    sources = prepare(real, suites, jobs, results.alone, results.keep)
    made = set().union(*(source.made for source in sources.values()))
    sandboxes = queue.Queue()
    for n in range(jobs):
        sandboxes.put(Sandbox(PLACE / "home" / str(n)))
    first = Sandbox(PLACE / "home" / "first")
    reaching = {suite: reached(first, suite, limit) for suite in suites}

    def verdict_of(slip):
        sandbox = sandboxes.get()
        try:
            return chosen_verdict(sandbox, slip, reaching, limit)
        finally:
            sandboxes.put(sandbox)

    done = 0

    def keep(slip, verdict, words, begin):
        nonlocal done
        done += 1
        results.known[slip.key] = [verdict, words]
        results.keep()
        print(f"{done}/{len(wanted)} {slip.name} {verdict} in {time.monotonic() - begin:.0f} s"
              f"{': ' + words if words else ''}", flush=True)

    begin = time.monotonic()
    with concurrent.futures.ThreadPoolExecutor(jobs) as pool:
        tried = {pool.submit(verdict_of, slip): slip for slip in wanted if slip.key in made}
        for each in concurrent.futures.as_completed(tried):
            keep(tried[each], *each.result(), begin)
    for slip in wanted:
        if slip.key not in made:
            begin = time.monotonic()
            keep(slip, *alone_verdict(first, slip, limit, jobs), begin)
