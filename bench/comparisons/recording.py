"""How much of the work of a report is recording where its pages begin, in instructions. They are counted by callgrind, which
takes a minute and a half for a million rows. It needs valgrind and the build of the preset bench.

    python3 -B bench/comparisons/recording.py [ROWS]
"""
import json
import os
import re
import subprocess
import sys
import tempfile

import rows

# The compiler may have put the one into its callers, and the other into the one.
RECORDING = r"kareport::(?:PageWriter::notePageStart|PageStarts::add)\("


def count(program, folder):
    """The instructions of a run, and those of them that go into recording pages."""
    out = f"{folder}/callgrind.out"
    subprocess.run(["valgrind", "--quiet", "--tool=callgrind", f"--callgrind-out-file={out}", program, "render", "--quiet",
                    "points.json"], cwd=folder, check=True)
    listed = subprocess.run(["callgrind_annotate", "--inclusive=yes", "--threshold=100", out], check=True,
                            capture_output=True, text=True).stdout
    number = r"\s*([\d,]+) \([^)]*\)\s+"
    whole = re.search(number + "PROGRAM TOTALS", listed)
    parts = re.findall(number + r"\S*:" + RECORDING, listed)
    if not whole or not parts:
        raise SystemExit("no page was recorded, or callgrind says it in another way")
    counts = [int(text.replace(",", "")) for text in parts]
    return int(whole.group(1).replace(",", "")), max(counts)


def main():
    number = int(sys.argv[1]) if len(sys.argv) > 1 else 1_000_000
    program = os.path.abspath("build/bench/bin/kareport")
    with tempfile.TemporaryDirectory() as folder:
        rows.make_template(folder)
        rows.make_csv(f"{folder}/points.csv", number)
        # A report that only becomes one file of text has no pages to record: it is written while it is made.
        job = rows.job("points.csv", "points.rep")
        job["output"].append("points.txt")
        with open(f"{folder}/points.json", "w") as file:
            json.dump(job, file)
        whole, part = count(program, folder)
    print(f"{number:,} rows: {whole:,} instructions, recording pages {part:,} of them, {part / whole:.4%}")


if __name__ == "__main__":
    main()
