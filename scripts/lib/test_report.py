#!/usr/bin/python3
"""Prints what a run of CTest came to, from its JUnit file: counts, every failure with its output, every test that
skipped, the slowest ones. Ends non-zero for a failure, for a run without a test, and for a skipped test as root."""

import os
import sys
import xml.etree.ElementTree as ElementTree

SLOWEST = 5
OUTPUT_LINES = 60


def load(path):
    try:
        return list(ElementTree.parse(path).getroot().iter("testcase"))
    except (OSError, ElementTree.ParseError) as fault:
        print(f"no report of the tests: {fault}")
        return []


def output_of(case):
    text = (case.findtext("system-out") or "").strip()
    return "\n".join("    " + line for line in text.splitlines()[-OUTPUT_LINES:])


def main():
    cases = load(sys.argv[1])
    failed = [case for case in cases if case.get("status") not in ("run", "notrun", "disabled")]
    skipped = [case for case in cases if case.get("status") in ("notrun", "disabled")]
    for case in failed:
        print(f"FAILED {case.get('name')}\n{output_of(case)}")
    for case in skipped:
        print(f"skipped {case.get('name')}\n{output_of(case)}")
    slowest = sorted(cases, key=lambda case: -float(case.get("time")))[:SLOWEST]
    for case in slowest:
        print(f"{float(case.get('time')):7.2f} s  {case.get('name')}")
    passed = len(cases) - len(failed) - len(skipped)
    print(f"{len(cases)} tests: {passed} passed, {len(failed)} failed, {len(skipped)} skipped")
    wrong = failed or not cases or (skipped and os.geteuid() == 0)
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main())
