"""CSV rows to an aligned, paged text report."""
import json
import random

from measure import Command, in_turn
from work import Comparison, Limit, make, ratio

TEMPLATE = """<ReportTemplate><Name>POINTS</Name><Title>Points</Title><Tables><Table><Name>Points</Name><Use>D</Use>
<OutputList>%s</OutputList></Table></Tables><Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList>
%s</VariableList></Dictionary></Dictionaries><Options><Separator>32</Separator></Options></ReportTemplate>
"""
COLUMNS = [("Number", "8", "RIGHT", "NUMBER"), ("Northing", "14.3", "RIGHT", "COORDINATE"),
           ("Easting", "14.3", "RIGHT", "COORDINATE"), ("Elevation", "10.3", "RIGHT", "ELEVATION"),
           ("Station", "12", "RIGHT", "STATION"), ("Name", "12", "LEFT", "NAME")]
FORMAT = "%8s %14.3f %14.3f %10.3f %12.3f %-12s"
AWK = 'NR>1{printf "' + FORMAT + '\\n",$1,$2,$3,$4,$5,$6}'
SQL = (f"SELECT printf('{FORMAT}',number,northing,easting,elevation,station,name) FROM points;")
FIXED = "".join(f'${name}=fmtnum(${name},"%.3f");' for name in ("northing", "easting", "elevation", "station"))


def make_template(folder, columns=None):
    """A template POINTS with a table of columns: variable, format, alignment and type."""
    columns = columns or COLUMNS
    fields = "".join(f"<Field><VariableName>{n}</VariableName><Label>{n}</Label><Format>{f}</Format>"
                     f"<Align>{a}</Align></Field>\n" for n, f, a, _ in columns)
    variables = "".join(f"<Variable><ID>{i}</ID><VariableName>{n}</VariableName><Type>{t}</Type></Variable>\n"
                        for i, (n, _, _, t) in enumerate(columns, 1))
    with open(f"{folder}/points.xml", "w") as file:
        file.write(TEMPLATE % (fields, variables))


def make_csv(path, rows, seed=7):
    numbers = random.Random(seed)
    with open(path, "w") as file:
        file.write("number,northing,easting,elevation,station,name\n")
        for i in range(rows):
            file.write(f"{i + 1},{5000 + numbers.random() * 4000:.4f},{16000 + numbers.random() * 4000:.4f},"
                       f"{50 + numbers.random() * 90:.3f},{i * 0.05:.3f},P{numbers.randrange(10 ** 6)}\n")


def job(csv, output):
    return {"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 72, "charsPerRow": 80},
            "template": {"file": "points.xml", "name": "POINTS"}, "data": {"points": {"csv": csv}},
            "report": [{"table": "Points", "data": "points"}], "output": [output]}


def make_files(folder, rows):
    make_template(folder)
    make_csv(f"{folder}/points.csv", rows)
    with open(f"{folder}/points.json", "w") as file:
        json.dump(job("points.csv", "points.rep"), file)


def commands(surroundings, folder):
    return [
        Command("kareport", [surroundings.kareport, "render", "points.json"], ours=True),
        Command("mawk printf", ["mawk", "-F,", AWK, "points.csv"], f"{folder}/mawk.txt"),
        Command("gawk printf", ["gawk", "-F,", AWK, "points.csv"], f"{folder}/gawk.txt",
                environment={"LC_ALL": "C"}),
        Command("sqlite3 printf", ["sqlite3", ":memory:", "-cmd", ".mode csv", "-cmd", ".import points.csv points",
                                   "-cmd", ".mode list", SQL], f"{folder}/sqlite3.txt"),
        Command("Miller pprint", ["mlr", "--icsv", "--opprint", "put", FIXED, "points.csv"], f"{folder}/miller.txt"),
    ]


def run(surroundings):
    comparisons = []
    medians = {}
    for rows, runs in ((surroundings.size(1_000_000, 10_000), surroundings.runs),
                       (surroundings.size(10_000_000, 100_000), min(surroundings.runs, 3))):
        with surroundings.folder() as folder:
            make(make_files, folder, rows)
            results = in_turn(commands(surroundings, folder), folder, runs)
        by_name = {result.name: result for result in results}
        ours, miller = by_name["kareport"], by_name["Miller pprint"]
        medians[rows] = ours.median
        limits = [Limit("time, of the fastest other", ratio(results, "kareport"), 0.33)]
        if miller.peak_kb:
            limits.append(Limit("memory, of Miller's", ours.peak_kb / miller.peak_kb, 0.4))
        if len(medians) == 2:
            first, second = medians.values()
            limits.append(Limit("time, of a tenth of the rows", second / first, 10.5))
        comparisons.append(Comparison(
            f"rows-{rows}", f"{rows:,} rows to a report",
            f"{rows:,} rows of 6 columns (number, northing, easting, elevation, station, name) from CSV to an aligned text "
            "with fixed decimals. kareport writes a paged report file with a heading on every page; the others print "
            "their lines without pages; Miller finds the widths of the columns itself, and holds all rows for that. The data "
            "is read, and all is written, in memory.", results, limits))
    return comparisons
