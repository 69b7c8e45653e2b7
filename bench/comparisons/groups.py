"""Rows in groups, with totals of each group and of all."""
import json
import random

from measure import Command, in_turn
from rows import TEMPLATE
from work import Comparison, Limit, make, ratio

COLUMNS = [("Layer", "8", "LEFT", "TEXT"), ("Number", "8", "RIGHT", "NUMBER"), ("Volume", "14.3", "RIGHT", "DOUBLE"),
           ("Area", "14.3", "RIGHT", "AREA"), ("Length", "12.3", "RIGHT", "LENGTH")]
LINE = "%-8s %8s %14.3f %14.3f %12.3f"
TOTAL = "%-8s %8d %14.3f %14.3f %12.3f"
# The rows of each group with a line of totals after them, and a last line of all totals.
SQL = f"""SELECT line FROM (
SELECT layer AS l, 0 AS k, rowid AS r, printf('{LINE}',layer,number,volume,area,length) AS line FROM points
UNION ALL SELECT layer, 1, 0, printf('{TOTAL}',layer,count(*),sum(volume),sum(area),sum(length)) FROM points GROUP BY layer
UNION ALL SELECT 'Z', 2, 0, printf('{TOTAL}','All',count(*),sum(volume),sum(area),sum(length)) FROM points
) ORDER BY l, k, r;"""
AWK = ('NR>1{if($1!=g){if(NR>2)printf "' + TOTAL + '\\n",g,n,v,a,l;g=$1;n=v=a=l=0}'
       'printf "' + LINE + '\\n",$1,$2,$3,$4,$5;n++;v+=$3;a+=$4;l+=$5}END{printf "' + TOTAL + '\\n",g,n,v,a,l}')


def make_files(folder, rows, groups):
    fields = "".join(f"<Field><VariableName>{n}</VariableName><Label>{n}</Label><Format>{f}</Format>"
                     f"<Align>{a}</Align></Field>\n" for n, f, a, _ in COLUMNS)
    variables = "".join(f"<Variable><ID>{i}</ID><VariableName>{n}</VariableName><Type>{t}</Type></Variable>\n"
                        for i, (n, _, _, t) in enumerate(COLUMNS, 1))
    sort = "<Sort><VariableName>Layer</VariableName></Sort>"
    with open(f"{folder}/points.xml", "w") as file:
        file.write(TEMPLATE.replace("<OutputList>", f"{sort}<OutputList>") % (fields, variables))
    numbers = random.Random(11)
    with open(f"{folder}/points.csv", "w") as file:
        file.write("layer,number,volume,area,length\n")
        for i in range(rows):
            file.write(f"L{i * groups // rows:05d},{i + 1},{numbers.random() * 900:.3f},{numbers.random() * 5000:.3f},"
                       f"{numbers.random() * 90:.3f}\n")
    plain = {"table": "Points", "data": "points"}
    sums = {"sum": ["Volume", "Area", "Length"]}
    grouped = plain | {"groups": [{"by": "Layer", "heading": "Layer {Layer}",
                                   "totals": [{"label": "{Layer}", "count": "Number"} | sums]}],
                       "totals": [{"label": "All", "count": "Number"} | sums]}
    for name, step in (("plain", plain), ("grouped", grouped)):
        with open(f"{folder}/{name}.json", "w") as file:
            json.dump({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 72, "charsPerRow": 80},
                       "template": {"file": "points.xml", "name": "POINTS"}, "data": {"points": {"csv": "points.csv"}},
                       "report": [step], "output": [f"{name}.rep"]}, file)


def commands(surroundings, folder):
    load = ["sqlite3", ":memory:", "-cmd", "CREATE TABLE points(layer TEXT,number INT,volume REAL,area REAL,length REAL)",
            "-cmd", ".mode csv", "-cmd", ".import --skip 1 points.csv points", "-cmd", ".mode list", SQL]
    stats = ["stats1", "-a", "count,sum", "-f", "volume,area,length", "-g", "layer"]
    return [
        Command("kareport", [surroundings.kareport, "render", "grouped.json"], ours=True),
        Command("kareport without groups", [surroundings.kareport, "render", "plain.json"], ours=True),
        Command("sqlite3 GROUP BY", load, f"{folder}/sqlite3.txt"),
        Command("mawk printf", ["mawk", "-F,", AWK, "points.csv"], f"{folder}/mawk.txt"),
        Command("Miller, totals alone", ["mlr", "--icsv", "--opprint", *stats, "points.csv"], f"{folder}/miller.txt"),
        Command("datamash, totals alone", ["datamash", "-t,", "--header-in", "-g", "1", "count", "2", "sum", "3", "sum", "4",
                                           "sum", "5"], f"{folder}/datamash.txt", input=f"{folder}/points.csv"),
    ]


def run(surroundings):
    rows, groups = surroundings.size(1_000_000, 10_000), surroundings.size(10_000, 100)
    with surroundings.folder() as folder:
        make(make_files, folder, rows, groups)
        results = in_turn(commands(surroundings, folder), folder, surroundings.runs)
    medians = {result.name: result.median for result in results}
    ours, plain = medians["kareport"], medians["kareport without groups"]
    limits = [Limit("time, of the same rows without groups", ours / plain if ours and plain else None, 1.25),
              Limit("time, of sqlite3 with the same lines", ratio(results, "kareport", ["sqlite3 GROUP BY"]), 1.0)]
    return [Comparison(
        f"groups-{rows}", f"{rows:,} rows in {groups:,} groups",
        f"{rows:,} rows of 5 columns from CSV to an aligned text, sorted by layer, with the count and three sums after each of "
        f"{groups:,} layers and after all of them. kareport writes a paged report with a heading over each group, and adds decimal "
        "numbers; sqlite3 and mawk write the rows and the totals, and add binary numbers; Miller and datamash write the totals "
        "alone.", results, limits)]
