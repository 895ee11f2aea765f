#!/usr/bin/python3
"""test_report.py JUNIT FOLDER [--may-skip]: prints what a run of CTest came to, from its JUnit file and, for tests that one process
ran, from GoogleTest's report of them in FOLDER: counts, every failure with its output, every test that skipped, the
slowest ones. Ends non-zero for a failure, for a run without a test, and, save with --may-skip, for a skipped test as
root."""

import dataclasses
import os
import pathlib
import sys
import xml.etree.ElementTree as ElementTree

SLOWEST = 5
OUTPUT_LINES = 60


@dataclasses.dataclass
class Result:
    name: str
    seconds: float
    outcome: str  # "passed", "failed" or "skipped"
    output: str

    def show(self, word):
        lines = self.output.strip().splitlines()[-OUTPUT_LINES:]
        print("\n".join([f"{word} {self.name}"] + ["    " + line for line in lines]))


def cases_of(path):
    try:
        return list(ElementTree.parse(path).getroot().iter("testcase"))
    except (OSError, ElementTree.ParseError) as fault:
        print(f"no report of the tests: {fault}")
        return []


def of_ctest(case):
    outcome = {"run": "passed", "notrun": "skipped", "disabled": "skipped"}.get(case.get("status"), "failed")
    return Result(case.get("name"), float(case.get("time")), outcome, case.findtext("system-out") or "")


def of_googletest(case, folder):
    said = [each.text or each.get("message") or "" for each in case if each.tag in ("failure", "skipped")]
    outcome = "failed" if case.find("failure") is not None else "passed"
    if case.get("result") != "completed" and outcome == "passed":
        outcome = "skipped"
    name = f"{folder}/{case.get('classname')}.{case.get('name')}"
    return Result(name, float(case.get("time")), outcome, "\n".join(said))


def results_of(whole, folder):
    """The tests that one test of CTest stands for: itself, or those that its process reported."""
    name, part = os.path.split(whole.name)
    if not part.startswith("part_"):
        return [whole]
    parts = [of_googletest(case, name) for case in cases_of(folder / f"{whole.name}.xml")]
    if not parts:
        return [dataclasses.replace(whole, outcome="failed", output=whole.output + "\nit reported no test")]
    # A process can also end badly after its last test.
    unexplained = whole.outcome != "passed" and not any(each.outcome == "failed" for each in parts)
    return parts + [whole] if unexplained else parts


def main():
    junit, folder = sys.argv[1], pathlib.Path(sys.argv[2])
    results = [part for case in cases_of(junit) for part in results_of(of_ctest(case), folder)]
    failed = [result for result in results if result.outcome == "failed"]
    skipped = [result for result in results if result.outcome == "skipped"]
    for result in failed:
        result.show("FAILED")
    for result in skipped:
        result.show("skipped")
    for result in sorted(results, key=lambda result: -result.seconds)[:SLOWEST]:
        print(f"{result.seconds:7.2f} s  {result.name}")
    passed = len(results) - len(failed) - len(skipped)
    print(f"{len(results)} tests: {passed} passed, {len(failed)} failed, {len(skipped)} skipped")
    may_skip = "--may-skip" in sys.argv[3:] or os.geteuid() != 0
    wrong = failed or not results or (skipped and not may_skip)
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main())
