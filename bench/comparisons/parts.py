"""The micro benchmarks, with what they may take and how their cost grows."""
import json
import os
import statistics
import subprocess

from work import Comparison

# Benchmark at N, the same at ten times N (or nothing), what an item of it is, how many of them, seconds at most at N.
PARTS = [
    ("writeLines/1000000", "writeLines/10000000", "1,000,000 lines of 80 characters written", 0.2),
    ("loadTemplate/200", "loadTemplate/2000", "200 templates in 1 MB, the last one loaded", 0.05),
    ("loadManyFields/10000", "loadManyFields/100000", "a table of 10,000 fields with short closing tags", None),
    ("scanUnclosedTags/10000", "scanUnclosedTags/100000", "30,000 opening tags without closing ones", None),
    ("readCsv/100000", "readCsv/1000000", "100,000 CSV rows split into cells", None),
    ("readBlankCsv/100000", "readBlankCsv/1000000", "100,000 blank lines read as CSV rows of one cell", None),
    ("readWideCsv/10000", "readWideCsv/100000", "a CSV header row of 10,000 names", None),
    ("readJsonLine/1000", "readJsonLine/10000", "1,000 JSON objects in one line, each with a key of its own", None),
    ("fixedNotation", None, "a number with 3 decimals", 40e-9),
    ("printfForComparison", None, "the same by printf, for comparison", None),
    ("formatField/5", None, "a coordinate in its column", 100e-9),
    ("formatField/9", None, "a station in its column", 100e-9),
    ("formatField/4", None, "a bearing in its column", 1e-6),
    ("pdfPages/100", "pdfPages/1000", "100 PDF pages of 72 × 80", 100 / 650),
    ("pdfOfOnePage/1", None, "a PDF of one page, with the characters of an earlier one", 0.004),
    ("pdfOfOnePage/0", None, "the same with characters that no earlier one had", 0.004),
    ("saveReportFile/120000", "saveReportFile/1200000", "a report file of 10 MB saved", 0.1),
    ("loadReportFile/120000", "loadReportFile/1200000", "a report file of 10 MB loaded", 0.1),
    ("richTextImage/300000", None, "the rich-text image of 300,000 lines", 0.15),
    ("readReportImage/30000", "readReportImage/300000", "that of 30,000 lines read", None),
    ("readFormattedText/10000", "readFormattedText/100000", "10,000 lines of formatted text read", None),
    ("writeReport/30000", "writeReport/300000", "30,000 lines written as rich text", None),
    ("printPages/100", "printPages/1000", "100 pages printed into a spool", 100 / 350),
    ("showReport/300000", None, "300,000 lines shown in a view", None),
    ("showBare/300000", None, "the same in a bare control, for comparison", None),
    ("showRichText/100000", None, "rich text of 100,000 lines shown", 2.0),
    ("keyInReport/300000/1/iterations:1000", None, "a key in 300,000 lines", 0.002),
    ("keyInReport/300000/2/iterations:1000", None, "the same with two views of the report", 0.002),
    ("keyInBare/300000/iterations:1000", None, "the same in a bare control, for comparison", None),
    ("writeWithoutWindow/300000", None, "300,000 lines written by a host", None),
    ("writeIntoWindow/300000", "writeIntoWindow/3000000", "the same with the report window open", 0.5),
]


def benchmarks(surroundings, pattern, repetitions, mixed=True):
    """The runs of each benchmark, by its name. @param mixed  in turn; otherwise all of one after the other, for
    benchmarks that leave their memory in a state that the others pay for"""
    command = [f"{surroundings.bench}/ka_bench", f"--benchmark_filter={pattern}", "--benchmark_format=json",
               f"--benchmark_repetitions={repetitions}", f"--benchmark_enable_random_interleaving={str(mixed).lower()}"]
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


def cost(runs):
    """What a benchmark takes: its own time an item where it says that, else the whole time."""
    own = [run["own_ns"] for run in runs if "own_ns" in run]
    return statistics.median(own or seconds(runs)), bool(own)


def run(surroundings):
    names = [name for part in PARTS for name in part[:2] if name]
    runs = benchmarks(surroundings, f"^({'|'.join(names)})$", surroundings.size(3, 1))
    rows = []
    for name, tenfold, what, most in PARTS:
        growth = None
        if tenfold:
            (once, isOwn), (ten, _) = cost(runs[name]), cost(runs[tenfold])
            growth = ten / once if isOwn else ten / once / 10
        rows.append({"what": what, "seconds": statistics.median(seconds(runs[name])), "most": most, "growth": growth})
    return [Comparison("parts", "Parts", "", [], [], parts=rows)]
