"""A report of a million lines opened at the desk, which loads it in pieces, beside a bare control that does so."""
import json
import os
import subprocess
import time

from measure import Result
from viewer import make_files
from work import Comparison, Limit, make, ratio

NAMES = {"kareport-desk": [], "bare QPlainTextEdit, in pieces of 10,000 lines": ["--bare"],
         "kareport-desk, View\\Edit Report": ["--view-edit"]}


def opened(program, file, arguments):
    """Seconds, the longest pause and the work in it in milliseconds, and the peak of memory."""
    process = subprocess.Popen([program, file, *arguments], stdout=subprocess.PIPE, stderr=subprocess.DEVNULL,
                               env={**os.environ, "QT_QPA_PLATFORM": "offscreen"})
    figures = json.loads(process.stdout.read())
    _, _, usage = os.wait4(process.pid, 0)
    process.returncode = 0
    return figures["seconds"], figures["longest_pause_ms"], figures["longest_work_ms"], usage.ru_maxrss


def run(surroundings):
    count = surroundings.size(1_000_000, 50_000)
    results = {name: Result(name, name.startswith("kareport-desk")) for name in NAMES}
    pauses = {name: [] for name in NAMES}
    works = {name: [] for name in NAMES}
    with surroundings.folder() as folder:
        make(make_files, folder, count)
        for turn in range(surroundings.runs + 1):
            for name, arguments in NAMES.items():
                file = f"{folder}/report.{'txt' if arguments else 'rep'}"
                seconds, pause, work, peak = opened(f"{surroundings.bench}/ka_long_report", file, arguments)
                if turn > 0:
                    results[name].seconds.append(seconds)
                    results[name].peak_kb = max(results[name].peak_kb, peak)
                    pauses[name].append(pause)
                    works[name].append(work)
                time.sleep(0.1)
    shown = list(results.values())
    ours, bare, edited = NAMES
    return [Comparison(
        "long-report", f"{count:,} lines opened at the desk, to all of them in the window",
        f"A report of {count:,} lines of 80 characters, from the command to the last line loaded, on the offscreen "
        "platform. The window answers meanwhile: its longest pause counts. View\\Edit Report opens a report of these lines "
        "that was just made.", shown,
        [Limit("time, of the bare control", ratio(shown, ours, [bare]), 1.2),
         Limit("longest pause of the window", max(pauses[ours]), 100, " ms"),
         Limit("longest pause, View\\Edit Report", max(pauses[edited]), 100, " ms")],
        extra=[f"Longest pause of the bare control: {max(pauses[bare])} ms. Processor time of the longest piece of work: "
               f"{max(works[ours]):.0f} ms, of the bare control {max(works[bare]):.0f} ms."])]
