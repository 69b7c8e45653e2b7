"""Runs the comparisons and writes docs/performance.md; started by bench/compare."""
import argparse
import dataclasses
import datetime
import importlib
import json
import os
import sys

import page
from measure import Result
from work import Comparison, Limit, Surroundings

HERE = os.path.dirname(os.path.abspath(__file__))
WORKS = ["rows", "groups", "results", "data", "pages", "report_file", "viewer", "long_report", "rich_text", "templates", "landxml", "batch", "stopping", "parts"]


def kept_path(folder, work):
    return os.path.join(folder, f"{work}.json")


def keep(folder, work, comparisons):
    os.makedirs(folder, exist_ok=True)
    with open(kept_path(folder, work), "w") as file:
        json.dump({"day": datetime.date.today().isoformat(),
                   "comparisons": [dataclasses.asdict(comparison) for comparison in comparisons]}, file, indent=1)


def read(folder, work):
    """The day of a work's last run and its comparisons."""
    with open(kept_path(folder, work)) as file:
        kept = json.load(file)
    comparisons = []
    for fields in kept["comparisons"]:
        fields["results"] = [Result(**result) for result in fields["results"]]
        fields["limits"] = [Limit(**limit) for limit in fields["limits"]]
        comparisons.append(Comparison(**fields))
    return kept["day"], comparisons


def main():
    parser = argparse.ArgumentParser(
        prog="bench/compare", description="Times our programs and others on the same work, in turn, and writes "
                                          "docs/performance.md with its pictures.")
    parser.add_argument("works", nargs="*", metavar="WORK", help=f"{', '.join(WORKS)}; all of them without one. The "
                        "others then stand on the page as they were measured last")
    parser.add_argument("--runs", type=int, default=5, help="runs of each program (default: %(default)s)")
    parser.add_argument("--quick", action="store_true", help="small inputs, to try the command; the page stays as it is")
    parser.add_argument("--build", default=os.path.join(HERE, "../../build/bench"), help="where the programs were built")
    options = parser.parse_args()
    if unknown := [work for work in options.works if work not in WORKS]:
        parser.error(f"no such work: {', '.join(unknown)}")
    kept = os.path.join(options.build, "comparisons")
    surroundings = Surroundings(options.build, options.runs, options.quick)
    for work in options.works or WORKS:
        print(work, file=sys.stderr, flush=True)
        comparisons = importlib.import_module(work).run(surroundings)
        for comparison in comparisons:
            shown = page.parts_table(comparison.parts) if comparison.parts else \
                f"{page.table(comparison)}\n{page.limits(comparison)}"
            print(f"\n{comparison.title}\n{shown}\n", flush=True)
        if not options.quick:
            keep(kept, work, comparisons)
    if options.quick:
        return
    if missing := [work for work in WORKS if not os.path.exists(kept_path(kept, work))]:
        print(f"The page is written once these were measured too: {', '.join(missing)}", file=sys.stderr)
        return
    days, comparisons = zip(*(read(kept, work) for work in WORKS))
    page.write([comparison for work in comparisons for comparison in work], " and ".join(sorted(set(days))))
    print("docs/performance.md was written.", file=sys.stderr)


if __name__ == "__main__":
    main()
