#!/usr/bin/env python3
"""Sums up a test run: the single cases of every suite, and one for each other test.

    summary.py REPORTS    a folder with ctest.xml and one JSON report for each suite that ended

Names what failed, and ends with the line "N passed, N failed". Exit status 1 when any failed."""
import json
import os
import sys
import xml.etree.ElementTree as ElementTree


def cases_of(report):
    """(passed, failed names, skipped) of one suite's report."""
    passed, failed, skipped = 0, [], 0
    for group in report["testsuites"]:
        for case in group["testsuite"]:
            if case.get("failures"):
                failed.append(f"{group['name']}.{case['name']}")
            elif case.get("result") == "SKIPPED" or case.get("status") == "NOTRUN":
                skipped += 1
            else:
                passed += 1
    return passed, failed, skipped


def main():
    folder = sys.argv[1]
    passed, failed, skipped = 0, [], 0
    try:
        tests = ElementTree.parse(os.path.join(folder, "ctest.xml")).getroot().iter("testcase")
    except (OSError, ElementTree.ParseError) as error:
        print(f"The tests did not run: {error}")
        print("0 passed, 1 failed")
        return 1
    for test in tests:
        name, status = test.get("name"), test.get("status")
        report = os.path.join(folder, name.removeprefix("suite.") + ".json")
        suite_failures = []
        if name.startswith("suite.") and os.path.exists(report):
            with open(report, encoding="utf-8") as file:
                counts = cases_of(json.load(file))
            passed, skipped = passed + counts[0], skipped + counts[2]
            suite_failures = [f"{name}: {case}" for case in counts[1]]
        elif status == "run":
            passed += 1
        elif status in ("notrun", "disabled"):
            skipped += 1
        # A suite that crashed has no report, or one that names no failure.
        if status == "fail" and not suite_failures:
            suite_failures = [name]
        failed += suite_failures
    for name in failed:
        print(f"failed: {name}")
    total = f"{passed} passed, {len(failed)} failed"
    print(f"{total}, {skipped} skipped" if skipped else total)
    return 1 if failed or not passed else 0


if __name__ == "__main__":
    sys.exit(main())
