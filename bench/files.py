#!/usr/bin/env python3
"""Times saving, loading and the PDF, beside iconv and ReportLab on the same text, in turn.

    bench/files.py [--megabytes N] [--pages N] [--runs N] [--build FOLDER]

Saving and loading are timed inside a process that holds the report; iconv as a whole process. The PDF is timed both ways:
the writing alone, and `kareport convert` as a whole process beside ReportLab, both with the same embedded face. Prints the
median, least and greatest time in seconds and the peak memory, and the ratios of the medians.
"""
import argparse
import multiprocessing
import os
import statistics
import subprocess
import sys
import tempfile
import time

REPORTLAB = """
import sys
from reportlab.pdfgen import canvas
from reportlab.pdfbase import pdfmetrics
from reportlab.pdfbase.ttfonts import TTFont
pdfmetrics.registerFont(TTFont('Mono', '/usr/share/fonts/truetype/dejavu/DejaVuSansMono.ttf'))
lines = [line.rstrip() for line in open(sys.argv[1], encoding='utf-8-sig', newline='\\n')]
pdf = canvas.Canvas(sys.argv[2], pagesize=(595.32, 841.92), pageCompression=1)
for page in range(0, len(lines), 72):
    text = pdf.beginText(28.35, 800)
    text.setFont('Mono', 8, 9.5)
    for line in lines[page:page + 72]:
        text.textLine(line)
    pdf.drawText(text)
    pdf.showPage()
pdf.save()
"""


def rows(count):
    for i in range(count):
        yield (f"P{i:<8}|{i * 0.05:13.3f}|{5000 + i * 7919 % 4000000 / 1000:14.3f}|"
               f"{16000 + i * 104729 % 4000000 / 1000:14.3f}|{i * 31 % 90000 / 1000:10.3f}|iron pipe   |").ljust(80)


def make_files(folder, megabytes, pages):
    text = "".join(line + "\r\n" for line in rows(megabytes * 1000000 // 83))
    with open(f"{folder}/text.utf16", "wb") as file:
        file.write(text.encode("utf-16-le"))
    with open(f"{folder}/pages.rep", "wb") as file:
        file.write(b"\xef\xbb\xbf")
        file.write("".join(line + "\r\r\n" for line in rows(72 * pages)).encode())


def run(command, folder, own_clock):
    """Seconds and peak kilobytes of a command; with `own_clock` as the command prints them."""
    begin = time.perf_counter()
    process = subprocess.Popen(command, cwd=folder, stdout=subprocess.PIPE)
    printed = process.stdout.read()
    _, status, usage = os.wait4(process.pid, 0)
    seconds = time.perf_counter() - begin
    if status != 0:
        sys.exit(f"{command} ended with {status}")
    return (float(printed.split()[0]), int(printed.split()[1])) if own_clock else (seconds, usage.ru_maxrss)


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("--megabytes", type=int, default=100)
    parser.add_argument("--pages", type=int, default=1000)
    parser.add_argument("--runs", type=int, default=7)
    parser.add_argument("--build", default=os.path.join(os.path.dirname(__file__), "../build/bench"))
    options = parser.parse_args()
    work = os.path.abspath(f"{options.build}/bench/ka_file_work")
    program = os.path.abspath(f"{options.build}/bin/kareport")
    where = "/dev/shm" if os.access("/dev/shm", os.W_OK) else None
    with tempfile.TemporaryDirectory(dir=where) as folder:
        # In a process of its own: a child that is started shows at least the memory of what started it.
        maker = multiprocessing.Process(target=make_files, args=(folder, options.megabytes, options.pages))
        maker.start()
        maker.join()
        # The system's Python is the one that has the package.
        commands = {
            "save": ([work, "save", "text.utf16", "saved.rep"], True),
            "iconv": (["iconv", "-f", "UTF-16LE", "-t", "UTF-8", "-o", "iconv.txt", "text.utf16"], False),
            "load": ([work, "load", "saved.rep"], True),
            "PDF, writing alone": ([work, "pdf", "pages.rep", "work.pdf"], True),
            "kareport convert": ([program, "convert", "pages.rep", "convert.pdf", "--set", "page.linesPerPage=72"],
                                 False),
            "ReportLab": (["/usr/bin/python3", "-c", REPORTLAB, "pages.rep", "reportlab.pdf"], False),
        }
        results = {name: [] for name in commands}
        for turn in range(options.runs + 1):
            for name, (command, own_clock) in commands.items():
                result = run(command, folder, own_clock)
                if turn > 0:  # the first turn warms up
                    results[name].append(result)
        saved = os.path.getsize(f"{folder}/saved.rep")
    print(f"{'':22} {'median s':>9} {'least':>7} {'most':>7} {'peak MB':>8}")
    medians = {}
    for name, values in results.items():
        seconds = [value[0] for value in values]
        medians[name] = statistics.median(seconds)
        peak = max(value[1] for value in values) / 1024
        print(f"{name:22} {medians[name]:9.3f} {min(seconds):7.3f} {max(seconds):7.3f} {peak:8.0f}")
    print(f"save / iconv: {medians['save'] / medians['iconv']:.2f}")
    print(f"load: {saved / medians['load'] / 1e6:.0f} MB/s")
    print(f"PDF: {options.pages / medians['PDF, writing alone']:.0f} pages a second")
    print(f"kareport convert / ReportLab: {medians['kareport convert'] / medians['ReportLab']:.2f}")


if __name__ == "__main__":
    main()
