"""The same rows from every source of data to a paged text report."""
import hashlib
import json
import os
import re
import shutil
import sqlite3
import subprocess
import sys

from measure import Command, in_turn
from rows import FORMAT, job, make_csv, make_template
from work import Comparison, Limit, make

SCRIPTS = os.path.join(os.path.dirname(os.path.abspath(__file__)), "../../scripts")
SQL = f"SELECT printf('{FORMAT}',number,northing,easting,elevation,station,name) FROM points;"
COLUMNS = "number, northing, easting, elevation, station, name"


def texts(folder):
    """The CSV rows with other delimiters and decimal signs."""
    with open(f"{folder}/points.csv") as rows, open(f"{folder}/points.txt", "w") as blanks, \
            open(f"{folder}/points-comma.csv", "w") as commas:
        for row in rows:
            blanks.write(row.replace(",", " "))
            commas.write(row.replace(",", ";").replace(".", ","))


def database(folder):
    """A table whose values are what CSV has: numbers as numbers, and the texts that look like some as texts."""
    with sqlite3.connect(f"{folder}/points.db") as points, open(f"{folder}/points.csv") as rows:
        points.execute("CREATE TABLE points (number TEXT, northing REAL, easting REAL, elevation REAL, station REAL, "
                       "name TEXT)")
        next(rows)
        points.executemany("INSERT INTO points VALUES (?, ?, ?, ?, ?, ?)", (row.rstrip().split(",") for row in rows))
    points.close()


def jobs(folder):
    sets = {"csv": {"csv": "points.csv"}, "sqlite": {"sqlite": "points.db", "table": "points"},
            "whitespace": {"csv": "points.txt", "delimiter": "whitespace"},
            "comma": {"csv": "points-comma.csv", "delimiter": ";", "decimal": ","},
            "postgresql": {"postgresql": "dbname=survey", "query": f"SELECT {COLUMNS} FROM points"}}
    for name, data in sets.items():
        made = job("points.csv", f"{name}.rep")
        made["data"] = {"points": {**data, "units": {"length": "m"}}}
        with open(f"{folder}/{name}.json", "w") as file:
            json.dump(made, file)


def make_files(folder, rows):
    make_template(folder)
    make_csv(f"{folder}/points.csv", rows)
    texts(folder)
    database(folder)
    jobs(folder)


class Server:
    """A PostgreSQL server of its own with the rows; nothing where none can be started."""

    def __init__(self, folder):
        self.folder = folder
        self.process = None
        self.environment = {"PGHOST": f"{folder}/pg/socket", "PGUSER": "survey", "PGDATABASE": "survey"}

    def __enter__(self):
        os.chmod(self.folder, 0o755)  # the server may be another user
        self.process = subprocess.Popen([f"{SCRIPTS}/private-postgres.sh", f"{self.folder}/pg", "sh", "-c",
                                         "echo ready; cat"], stdin=subprocess.PIPE, stdout=subprocess.PIPE)
        if self.process.stdout.readline() != b"ready\n":
            return None
        self.psql("CREATE TABLE points (number text, northing float8, easting float8, elevation float8, station float8, "
                  "name text)")
        self.psql("\\copy points FROM 'points.csv' WITH (FORMAT csv, HEADER)")
        self.psql("VACUUM ANALYZE points")
        return self

    def psql(self, command):
        subprocess.run(["psql", "-q", "-X", "-c", command], check=True, stdout=subprocess.DEVNULL, cwd=self.folder,
                       env={**os.environ, **self.environment})

    def __exit__(self, *failure):
        self.process.stdin.close()
        self.process.wait()


def commands(surroundings, folder, server):
    def ours(name, shown, **more):
        return Command(shown, [surroundings.kareport, "render", f"{name}.json"], ours=True, **more)
    all_commands = [
        ours("csv", "kareport, CSV"), ours("whitespace", "kareport, blanks"), ours("comma", "kareport, decimal commas"),
        ours("sqlite", "kareport, SQLite"),
        Command("sqlite3 printf", ["sqlite3", "points.db", SQL], f"{folder}/sqlite3.txt")]
    if server is not None:
        all_commands += [
            ours("postgresql", "kareport, PostgreSQL", environment=server.environment),
            Command("psql COPY", ["psql", "-q", "-X", "-c", f"COPY points TO STDOUT"],
                    environment=server.environment)]
    return all_commands


def reports_differ(folder, names):
    """How many of the reports are not the one from CSV."""
    def digest(name):
        with open(f"{folder}/{name}.rep", "rb") as file:
            return hashlib.file_digest(file, "sha256").digest()
    first = digest("csv")
    return sum(digest(name) != first for name in names)


# What is done for notes: for each value and row, and for a table. Each has instructions in every run with a table; the build of
# the preset bench puts none of them into its callers.
NOTES = ["addShown(", "setRowLine(", "JobSteps::noteColumns(", "JobSteps::noteSortKeys(", "JobSteps::noteSource(",
         "JobSteps::noteValues("]


def share_of(names, listed):
    """The part of all instructions that functions and what they call have, from the inclusive list of callgrind_annotate."""
    counts = {name: 0 for name in names}
    total = 0
    for line in listed.splitlines():
        match = re.match(r"\s*([\d,]+)\s+(.*)", line)
        if match is None:
            continue
        count = int(match[1].replace(",", ""))
        if "PROGRAM TOTALS" in match[2]:
            total = count
        for name in names:
            if re.search(r"(?<!\w)" + re.escape(name), match[2]):
                counts[name] = max(counts[name], count)  # a function that calls a part of itself has the whole
    unknown = [name for name, count in counts.items() if count == 0]
    if total == 0 or unknown:
        raise RuntimeError(f"callgrind lists no instructions of {', '.join(unknown) or 'the program'}")
    return sum(counts.values()) / total


def notes_share(surroundings, folder):
    """What the notes cost, as a part of all instructions, by callgrind; nothing where that is not installed."""
    if shutil.which("valgrind") is None or shutil.which("callgrind_annotate") is None:
        return None
    out = f"{folder}/callgrind.out"
    subprocess.run(["valgrind", "--tool=callgrind", f"--callgrind-out-file={out}", surroundings.kareport, "render",
                    "csv.json"], cwd=folder, check=True, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
    shown = subprocess.run(["callgrind_annotate", "--inclusive=yes", "--threshold=100", "--show-percs=no", out], cwd=folder,
                           check=True, stdout=subprocess.PIPE, stderr=subprocess.DEVNULL).stdout.decode()
    return share_of(NOTES, shown)


def run(surroundings):
    rows = surroundings.size(1_000_000, 10_000)
    with surroundings.folder() as folder:
        make(make_files, folder, rows)
        with Server(folder) as server:
            results = in_turn(commands(surroundings, folder, server), folder, surroundings.runs)
            names = ["whitespace", "comma", "sqlite"] + (["postgresql"] if server is not None else [])
            differing = reports_differ(folder, names)
        share = notes_share(surroundings, folder)
    median = {result.name: result.median for result in results}
    csv = median["kareport, CSV"]
    limits = [
        Limit("time from blanks, of that from CSV", median["kareport, blanks"] / csv, 1.15),
        Limit("time with decimal commas, of that from CSV", median["kareport, decimal commas"] / csv, 1.15),
        Limit("time from SQLite, of that from CSV", median["kareport, SQLite"] / csv, 1.5),
        Limit("time from SQLite, of sqlite3 printing", median["kareport, SQLite"] / median["sqlite3 printf"], 0.9)]
    if "psql COPY" in median:
        limits.append(Limit("time from PostgreSQL, of psql with COPY and CSV together",
                            median["kareport, PostgreSQL"] / (median["psql COPY"] + csv), 1.2))
    else:
        print("  no PostgreSQL server is installed", file=sys.stderr)
    limits.append(Limit("reports that are not the one from CSV", differing, 0))
    limits.append(Limit("instructions for notes, of all", share, 0.02))
    return [Comparison(
        "data", f"{rows:,} rows from every source",
        f"The same {rows:,} rows of 6 columns as a CSV file, as texts with blanks between the cells and with decimal commas, as a "
        "table of SQLite and of a PostgreSQL server of its own. The report must be the same byte for byte. sqlite3 prints its "
        "rows with fixed decimals; psql copies them to nowhere.", results, limits)]
