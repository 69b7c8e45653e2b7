#!/usr/bin/env python3
"""Times kareport as whole processes, beside mawk on the same rows, in turn.

    bench/whole-process.py [--rows N] [--runs N] [--program FILE]

Prints for each command the median, least and greatest wall time in seconds and the peak memory, and the ratios of the
medians. Files are made in a temporary folder, in memory where /dev/shm is there, so that the disk does not count.
"""
import argparse
import json
import os
import random
import statistics
import subprocess
import sys
import tempfile
import time

TEMPLATE = """<ReportTemplate><Name>POINTS</Name><Title>Points</Title><Tables><Table><Name>Points</Name><Use>D</Use>
<OutputList>%s</OutputList></Table></Tables><Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList>
%s</VariableList></Dictionary></Dictionaries><Options><Separator>32</Separator></Options></ReportTemplate>
"""
COLUMNS = [("Number", "8", "RIGHT", "NUMBER"), ("Northing", "14.3", "RIGHT", "COORDINATE"),
           ("Easting", "14.3", "RIGHT", "COORDINATE"), ("Elevation", "10.3", "RIGHT", "ELEVATION"),
           ("Station", "12", "RIGHT", "STATION"), ("Name", "12", "LEFT", "NAME")]
MAWK = 'NR>1{printf "%8s %14.3f %14.3f %10.3f %12.3f %-12s\\n",$1,$2,$3,$4,$5,$6}'


def make_files(folder, rows):
    fields = "".join(f"<Field><VariableName>{n}</VariableName><Label>{n}</Label><Format>{f}</Format>"
                     f"<Align>{a}</Align></Field>\n" for n, f, a, _ in COLUMNS)
    variables = "".join(f"<Variable><ID>{i}</ID><VariableName>{n}</VariableName><Type>{t}</Type></Variable>\n"
                        for i, (n, _, _, t) in enumerate(COLUMNS, 1))
    with open(f"{folder}/points.xml", "w") as file:
        file.write(TEMPLATE % (fields, variables))
    random.seed(7)
    for name, count in (("points", rows), ("page", 50)):
        with open(f"{folder}/{name}.csv", "w") as file:
            file.write("number,northing,easting,elevation,station,name\n")
            for i in range(count):
                file.write(f"{i + 1},{5000 + random.random() * 4000:.4f},{16000 + random.random() * 4000:.4f},"
                           f"{50 + random.random() * 90:.3f},{i * 0.05:.3f},P{random.randrange(10 ** 6)}\n")
        for fixed in (True, False):
            page = {"linesPerPage": 72, "charsPerRow": 80} if fixed else {}
            job = {"now": "2024-03-05T14:07:00", "page": page,
                   "template": {"file": "points.xml", "name": "POINTS"},
                   "data": {"points": {"csv": f"{name}.csv"}},
                   "report": [{"table": "Points", "data": "points"}], "output": [f"{name}.rep"]}
            with open(f"{folder}/{name}-{'fixed' if fixed else 'measured'}.json", "w") as file:
                json.dump(job, file)


def run(command, folder, output=None):
    """Wall seconds and peak kilobytes of a command."""
    with open(output or os.devnull, "wb") as out:
        begin = time.perf_counter()
        process = subprocess.Popen(command, cwd=folder, stdout=out)
        _, status, usage = os.wait4(process.pid, 0)
        seconds = time.perf_counter() - begin
    if status != 0:
        sys.exit(f"{command} ended with {status}")
    return seconds, usage.ru_maxrss


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("--rows", type=int, default=1_000_000)
    parser.add_argument("--runs", type=int, default=7)
    parser.add_argument("--program", default=os.path.join(os.path.dirname(__file__),
                                                          "../build/bench/bin/kareport"))
    options = parser.parse_args()
    program = os.path.abspath(options.program)
    where = "/dev/shm" if os.access("/dev/shm", os.W_OK) else None
    with tempfile.TemporaryDirectory(dir=where) as folder:
        make_files(folder, options.rows)
        commands = {
            f"kareport, {options.rows} rows": ([program, "render", "points-fixed.json"], None),
            f"mawk printf, {options.rows} rows": (["mawk", "-F,", MAWK, "points.csv"], f"{folder}/mawk.txt"),
            "kareport, one page": ([program, "render", "page-fixed.json"], None),
            "kareport, one page, measured": ([program, "render", "page-measured.json"], None),
        }
        results = {name: [] for name in commands}
        for turn in range(options.runs + 1):
            for name, (command, output) in commands.items():
                result = run(command, folder, output)
                if turn > 0:  # the first turn warms up
                    results[name].append(result)
    print(f"{'':34} {'median s':>9} {'least':>7} {'most':>7} {'peak MB':>8}")
    medians = {}
    for name, values in results.items():
        seconds = [value[0] for value in values]
        medians[name] = statistics.median(seconds)
        peak = max(value[1] for value in values) / 1024
        print(f"{name:34} {medians[name]:9.3f} {min(seconds):7.3f} {max(seconds):7.3f} {peak:8.0f}")
    ours, theirs = list(medians.values())[:2]
    print(f"kareport / mawk: {ours / theirs:.2f}")


if __name__ == "__main__":
    main()
