"""Points of a LandXML file listed, beside a style sheet; stations of an alignment."""
import json
import random

from measure import Command, Result, in_turn
from parts import benchmarks, seconds
from rows import make_template
from work import Comparison, Limit, make, ratio

COLUMNS = [("Name", "8", "RIGHT", "NUMBER"), ("Code", "6", "LEFT", "TEXT"), ("Northing", "14.3", "RIGHT", "COORDINATE"),
           ("Easting", "14.3", "RIGHT", "COORDINATE"), ("Elevation", "10.3", "RIGHT", "ELEVATION")]
SHEET = """<xsl:stylesheet version="1.0" xmlns:xsl="http://www.w3.org/1999/XSL/Transform"
 xmlns:l="http://www.landxml.org/schema/LandXML-1.2"><xsl:output method="text"/>
<xsl:template match="/"><xsl:for-each select="l:LandXML/l:CgPoints/l:CgPoint">
<xsl:variable name="rest" select="substring-after(., ' ')"/>
<xsl:value-of select="concat(@name, ' ', @code, ' ', format-number(substring-before(., ' '), '0.000'), ' ',
 format-number(substring-before($rest, ' '), '0.000'), ' ', format-number(substring-after($rest, ' '), '0.000'), '&#10;')"/>
</xsl:for-each></xsl:template></xsl:stylesheet>
"""


def make_file(path, points, records):
    """A survey of points, and a surface whose points and faces are as many records."""
    numbers = random.Random(7)

    def coordinates():
        return (f"{5516000 + numbers.random() * 4000:.4f} {3512000 + numbers.random() * 4000:.4f} "
                f"{100 + numbers.random() * 90:.3f}")
    with open(path, "w") as file:
        file.write('<?xml version="1.0"?>\n<LandXML xmlns="http://www.landxml.org/schema/LandXML-1.2" version="1.2">\n'
                   '<Units><Metric linearUnit="meter" areaUnit="squareMeter" directionUnit="decimal degrees"/></Units>\n'
                   '<CgPoints name="survey">\n')
        for i in range(points):
            file.write(f'<CgPoint name="{i + 1}" code="EP" desc="edge">{coordinates()}</CgPoint>\n')
        file.write('</CgPoints>\n<Surfaces><Surface name="ground"><Definition surfType="TIN"><Pnts>\n')
        corners = records // 3
        for i in range(corners):
            file.write(f'<P id="{i + 1}">{coordinates()}</P>\n')
        file.write("</Pnts><Faces>\n")
        for _ in range(records - corners):
            first = numbers.randrange(corners - 2) + 1
            file.write(f"<F>{first} {first + 1} {first + 2}</F>\n")
        file.write("</Faces></Definition></Surface></Surfaces>\n</LandXML>\n")


def make_files(folder, points, records):
    make_template(folder, COLUMNS)
    with open(f"{folder}/points.xsl", "w") as file:
        file.write(SHEET)
    with open(f"{folder}/points.json", "w") as file:
        json.dump({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 72, "charsPerRow": 80},
                   "template": {"file": "points.xml", "name": "POINTS"},
                   "data": {"points": {"landxml": "survey.xml", "list": "points"}},
                   "report": [{"table": "Points", "data": "points"}], "output": ["points.txt"]}, file)
    make_file(f"{folder}/survey.xml", points, records)


def points_comparison(surroundings):
    points, records = surroundings.size((500_000, 2_000_000), (5_000, 20_000))
    work = f"{surroundings.bench}/ka_landxml_work"
    with surroundings.folder() as folder:
        make(make_files, folder, points, records)
        results = in_turn([
            Command("kareport, a report", [surroundings.kareport, "render", "points.json"], ours=True,
                    processor_time=True),
            Command("kareport, the list alone", [work, "points", "survey.xml"], own_clock=True, ours=True),
            Command("xsltproc", ["xsltproc", "points.xsl", "survey.xml"], f"{folder}/xsltproc.txt",
                    processor_time=True),
            Command("the bare parser (expat)", [work, "walk", "survey.xml"], own_clock=True, bound=True),
        ], folder, surroundings.runs)
    by_name = {result.name: result for result in results}
    report, rows = by_name["kareport, a report"], by_name["kareport, the list alone"]
    sheet, bare = by_name["xsltproc"], by_name["the bare parser (expat)"]
    return Comparison(
        "landxml-points", f"{points:,} points of a LandXML file listed",
        f"A LandXML file of {points:,} points and a surface of {records:,} points and faces. kareport writes the points as a "
        "paged report; its list alone gives them as objects; xsltproc prints them through a style sheet of a few lines. Seconds "
        "of processor time, of all threads together.", results,
        [Limit("processor time of the report, of xsltproc's", report.median / sheet.median, 0.4),
         Limit("processor time of the list, of the bare parser's", rows.median / bare.median, 1.3),
         Limit("peak memory of the report, MB", report.peak_kb / 1024, 100),
         Limit("peak memory of the list, MB", rows.peak_kb / 1024, 100)])


def stations_comparison(surroundings):
    rows, elements = surroundings.size((1_000_000, 500), (100_000, 500))
    names = {f"listLandXmlStations/{rows}/{elements}": f"{elements} elements",
             f"listLandXmlStations/{rows}/5": "5 elements"}
    runs = benchmarks(surroundings, f"^({'|'.join(names)})$", max(surroundings.runs, 3))
    results = [Result(shown, True, seconds=seconds(runs[name])) for name, shown in names.items()]
    return Comparison(
        "landxml-stations", f"{rows:,} stations of an alignment",
        f"{rows:,} stations of an alignment of lines, clothoids and arcs, each with two points beside it, as objects. Inside one "
        "process. What a row takes does not grow with the elements.", results,
        [Limit("seconds for 500,000 rows", results[0].median * 500_000 / rows, 1.0),
         Limit("time, of an alignment of 5 elements", ratio(
             [results[0], Result(results[1].name, seconds=results[1].seconds)], results[0].name), 1.3)])


def run(surroundings):
    return [points_comparison(surroundings), stations_comparison(surroundings)]
