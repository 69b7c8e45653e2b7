"""How soon the program ends that is asked to, wherever it is in its work."""
import signal
import subprocess
import time

from measure import Result
from pages import LINES, make_files as make_pages
from rows import make_files as make_rows
from work import Comparison, Limit, make

RUNS = 10


def seconds_to_end(arguments, folder, after):
    """Seconds from the signal to the end of a program that has worked for a while; nothing where it had ended before."""
    # A shell's job in the background ignores SIGINT, and so would what it starts.
    process = subprocess.Popen(arguments, cwd=folder, stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL,
                               stderr=subprocess.DEVNULL,
                               preexec_fn=lambda: signal.signal(signal.SIGINT, signal.SIG_DFL))
    time.sleep(after)
    begin = time.perf_counter()
    process.send_signal(signal.SIGINT)
    process.wait()
    seconds = time.perf_counter() - begin
    return seconds if process.returncode == -signal.SIGINT else None


def run(surroundings):
    rows = surroundings.size(1_000_000, 300_000)
    pages = surroundings.size(10_000, 3000)
    works = {f"{rows:,} rows to a report": ["render", "points.json"],
             f"{pages:,} pages to a PDF": ["convert", "pages.rep", "pages.pdf", "--set", f"page.linesPerPage={LINES}"]}
    results = []
    with surroundings.folder() as folder:
        make(make_rows, folder, rows)
        make(make_pages, folder, pages)
        for name, arguments in works.items():
            command = [surroundings.kareport, *arguments]
            begin = time.perf_counter()
            subprocess.run(command, cwd=folder, check=True, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
            whole = time.perf_counter() - begin
            result = Result(name, True)
            for turn in range(RUNS):
                # Spread over the work, but for its last part, which may be over before the signal comes.
                seconds = seconds_to_end(command, folder, whole * (0.05 + 0.7 * turn / (RUNS - 1)))
                if seconds is not None:
                    result.seconds.append(seconds)
            results.append(result)
    longest = [max(result.seconds, default=None) for result in results]
    return [Comparison(
        "stopping", "From Ctrl+C to the end",
        f"kareport is sent SIGINT in the middle of its work, {RUNS} times at moments that are spread over it.", results,
        [Limit(f"longest, {result.name}", most, 0.3, " s") for result, most in zip(results, longest)])]
