"""CSV rows to a workbook, a web page, and rows of data."""
from measure import Command, in_turn
from rows import make_files
from work import Comparison, Limit, make, ratio

OPENPYXL = """
import csv, openpyxl
from openpyxl.cell import WriteOnlyCell
book = openpyxl.Workbook(write_only=True)
sheet = book.create_sheet('Points')
formats = ['@', '0.000', '0.000', '0.000', '0+000.000', '@']
with open('points.csv', newline='') as file:
    rows = csv.reader(file)
    sheet.append(next(rows))
    for row in rows:
        cells = []
        for column, text in enumerate(row):
            cell = WriteOnlyCell(sheet, float(text) if 0 < column < 5 else text)
            cell.number_format = formats[column]
            cells.append(cell)
        sheet.append(cells)
book.save('openpyxl.xlsx')
"""


def ours(surroundings, output):
    return Command("kareport", [surroundings.kareport, "render", "points.json", "-o", output], ours=True)


def workbook(surroundings, rows):
    with surroundings.folder() as folder:
        make(make_files, folder, rows)
        commands = [ours(surroundings, "points.xlsx"),
                    Command("libxlsxwriter alone", [f"{surroundings.bench}/ka_bare_workbook", "points.csv", "bare.xlsx"]),
                    Command("openpyxl", ["/usr/bin/python3", "-c", OPENPYXL])]
        results = in_turn(commands, folder, min(surroundings.runs, 3))
    return Comparison(
        f"results-xlsx-{rows}", f"{rows:,} rows to a workbook",
        f"{rows:,} rows of 6 columns from CSV to a workbook with number formats. kareport formats the report as well, and writes "
        "the digits that it prints. The data is read, and all is written, in memory.", results,
        [Limit("time, of libxlsxwriter alone", ratio(results, "kareport", ["libxlsxwriter alone"]), 1.2)])


def web_page(surroundings, rows):
    with surroundings.folder() as folder:
        make(make_files, folder, rows)
        commands = [ours(surroundings, "points.html"),
                    Command("Miller", ["mlr", "--icsv", "--oxtab", "cat", "points.csv"], f"{folder}/miller.txt"),
                    Command("mawk", ["mawk", "-F,", 'BEGIN{print "<table>"}NR>1{printf "<tr><td>%s</td><td>%.3f</td>'
                                     '<td>%.3f</td><td>%.3f</td><td>%.3f</td><td>%s</td></tr>\\n",$1,$2,$3,$4,$5,$6}'
                                     'END{print "</table>"}', "points.csv"], f"{folder}/mawk.html")]
        results = in_turn(commands, folder, surroundings.runs)
    return Comparison(
        f"results-html-{rows}", f"{rows:,} rows to web pages",
        f"{rows:,} rows of 6 columns from CSV to web pages of 20,000 rows. mawk writes the rows of a table without escaping a "
        "character; Miller, which has no web pages, writes each row as lines of names and values. The data is read, and all is "
        "written, in memory.", results, [Limit("time, of the fastest other", ratio(results, "kareport"), 1.0)])


def data(surroundings, rows):
    with surroundings.folder() as folder:
        make(make_files, folder, rows)
        commands = [ours(surroundings, "points.jsonl"),
                    Command("Miller", ["mlr", "--icsv", "--ojsonl", "cat", "points.csv"], f"{folder}/miller.jsonl")]
        results = in_turn(commands, folder, surroundings.runs)
    return Comparison(
        f"results-jsonl-{rows}", f"{rows:,} rows to JSON lines",
        f"{rows:,} rows of 6 columns from CSV to an object a line, in the units of the data. The data is read, and all is "
        "written, in memory.", results, [Limit("time, of Miller's", ratio(results, "kareport"), 0.5)])


def run(surroundings):
    rows = surroundings.size(1_000_000, 10_000)
    return [workbook(surroundings, rows), web_page(surroundings, rows), data(surroundings, rows)]
