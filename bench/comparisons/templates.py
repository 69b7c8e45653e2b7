"""A file of templates read, beside parsers of XML; and the other micro benchmarks with their limits."""
import json
import os
import statistics
import subprocess

from measure import Result
from work import Comparison, Limit, ratio

# What each benchmark may take; own_ns is the program's own time for an item, without the system's.
PARTS = [
    # name, what it does, figure, factor to the unit shown, unit, at most (or at least, with a minus)
    ("writeLine/1000000", "a line of 80 characters written", "own_ns", 1, "ns", 200),
    ("loadTemplate/200", "the last of 200 templates in 1 MB", "real_ms", 1, "ms", 50),
    ("readCsv/1000000", "CSV split into cells, a byte", "own_ns", 1, "ns", 2),
    ("fixedNotation", "a number with 3 decimals", "real_ns", 1, "ns", 40),
    ("formatField/5", "a coordinate in its column", "real_ns", 1, "ns", 100),
]


def benchmarks(surroundings, pattern, repetitions):
    """The medians of the repetitions of each benchmark, by its name."""
    command = [f"{surroundings.bench}/ka_bench", f"--benchmark_filter={pattern}", "--benchmark_format=json",
               f"--benchmark_repetitions={repetitions}", "--benchmark_enable_random_interleaving=true"]
    environment = {**os.environ, "QT_QPA_PLATFORM": "offscreen"}
    answer = subprocess.run(command, env=environment, check=True, stdout=subprocess.PIPE, stderr=subprocess.DEVNULL)
    runs = {}
    for run in json.loads(answer.stdout)["benchmarks"]:
        if run["run_type"] == "iteration":
            runs.setdefault(run["run_name"], []).append(run)
    return runs


def seconds(runs):
    factor = {"ns": 1e-9, "us": 1e-6, "ms": 1e-3, "s": 1}
    return [run["real_time"] * factor[run["time_unit"]] for run in runs]


def run(surroundings):
    runs = benchmarks(surroundings, "(loadTemplate|parsePugixml|parseLibxml2)/", max(surroundings.runs, 3))
    names = {"loadTemplate/200": "kareport", "parsePugixml/200": "pugixml", "parseLibxml2/200": "libxml2"}
    results = [Result(shown, shown == "kareport", seconds(runs[name])) for name, shown in names.items()]
    at_ten = statistics.median(seconds(runs["loadTemplate/2000"])) / results[0].median
    return [Comparison(
        "templates", "200 templates in 1 MB read",
        "A file of 200 templates, 1 MB: kareport opens it, looks for the last template and reads its tables, fields and "
        "dictionaries; the others parse the file as XML and keep all of it. Inside one process, in turn.", results,
        [Limit("time, of pugixml", ratio(results, "kareport", ["pugixml"]), 3.0),
         Limit("time of ten times as many templates, of this", at_ten, 11.0)])]
