#!/usr/bin/env python3
"""Totals of random tables against Python's decimal.

    tests/totals-test.py KAREPORT [TABLES]

Writes so many jobs (3000 without a number) with tables of random numbers in random units, has kareport render them, and works
every total out again: of the cells as they are written, or of the digits that were printed.
"""
import decimal
import json
import random
import subprocess
import sys
import tempfile
from decimal import Decimal
from fractions import Fraction
from pathlib import Path

decimal.getcontext().prec = 120
PI = Fraction("3.141592653589793238462643383279502884197169399375105820974944")
LENGTHS = {"m": Fraction(1), "mm": Fraction("0.001"), "km": Fraction(1000), "ft": Fraction("0.3048"),
           "usft": Fraction(1200, 3937)}
AREAS = {"m2": Fraction(1), "ha": Fraction(10000), "km2": Fraction(10 ** 6), "ft2": Fraction("0.09290304"),
         "ac": Fraction("4046.8564224")}
ANGLES = {"deg": Fraction(1, 360), "gon": Fraction(1, 400), "rad": 1 / (2 * PI), "dms": Fraction(1, 360)}
KINDS = {"S": "sum", "M": "mean", "I": "min", "A": "max", "N": "count"}  # by the labels of their lines
COLUMNS = [("Number", "DOUBLE", None), ("Length", "LENGTH", LENGTHS), ("Area", "AREA", AREAS), ("Angle", "ANGLE", ANGLES)]
ANGLE_DECIMALS = 4


def template():
    fields = "<Field><VariableName>Group</VariableName><Label>G</Label><Format>4</Format></Field>" + "".join(
        f"<Field><VariableName>{name}</VariableName><Label>{name}</Label><Format>40.{ANGLE_DECIMALS}</Format>"
        "<Align>RIGHT</Align></Field>" for name, _, _ in COLUMNS)
    variables = "<Variable><ID>1</ID><VariableName>Group</VariableName><Type>TEXT</Type></Variable>" + "".join(
        f"<Variable><ID>{i}</ID><VariableName>{name}</VariableName><Type>{kind}</Type></Variable>"
        for i, (name, kind, _) in enumerate(COLUMNS, 2))
    return ("<ReportTemplate><Name>T</Name><Title>T</Title><Tables><Table><Name>T</Name><Use>D</Use><Sort>"
            f"<VariableName>Group</VariableName></Sort><OutputList>{fields}</OutputList></Table></Tables><Dictionaries>"
            f"<Dictionary><DictionaryName>D</DictionaryName><VariableList>{variables}</VariableList></Dictionary>"
            "</Dictionaries><Options><Separator>124</Separator></Options></ReportTemplate>")


def cell(numbers):
    """A number of up to 15 digits, sometimes none."""
    kind = numbers.randrange(20)
    if kind == 0:
        return ""
    digits = numbers.choice((1, 3, 5, 7, 9, 12, 15))
    text = str(numbers.randrange(10 ** digits))
    decimals = numbers.choice((0, 1, 2, 3, 4, 6, 9))
    text = text.rjust(decimals + 1, "0")
    if decimals:
        text = f"{text[:-decimals]}.{text[-decimals:]}"
    return ("-" if numbers.randrange(3) == 0 else "") + text


def angle(numbers, unit):
    """An angle, where the data has such in degrees, minutes and seconds."""
    if unit != "dms" or numbers.randrange(4) == 0:
        return cell(numbers)
    seconds = str(numbers.randrange(60)) + numbers.choice(("", f".{numbers.randrange(10)}", f".{numbers.randrange(10000):04}"))
    sign = "-" if numbers.randrange(3) == 0 else ""
    return f"{sign}{numbers.randrange(400)}-{numbers.randrange(60)}-{seconds}"


def value(text):
    """The number that a cell says."""
    parts = text.lstrip("-").split("-")
    number = sum(Fraction(part) / 60 ** i for i, part in enumerate(parts))
    return -number if text.startswith("-") else number


def write(folder, seed):
    """A job of a seed and its rows."""
    numbers = random.Random(seed)
    count = numbers.choice((0, 1, 2, 10, 40))
    units = {"length": numbers.choice(list(LENGTHS)), "area": numbers.choice(list(AREAS)),
             "angle": numbers.choice(list(ANGLES))}
    rows = [[f"g{numbers.randrange(4)}"] + [cell(numbers) for _ in COLUMNS[:-1]] + [angle(numbers, units["angle"])]
            for _ in range(count)]
    shown = {"lengthUnit": numbers.choice(list(LENGTHS)), "areaUnit": numbers.choice(list(AREAS)),
             "angleUnit": numbers.choice(("deg", "gon", "rad")), "lengthDecimals": numbers.randrange(7),
             "numberDecimals": numbers.randrange(7)}
    names = [name for name, _, _ in COLUMNS]
    lines = [{"label": label, kind: names} for label, kind in KINDS.items()]
    job = {"now": "2024-03-05T14:07:00", "header": False, "page": {"linesPerPage": 100000, "charsPerRow": 80},
           "settings": shown, "template": {"file": "t.xml", "name": "T"},
           "data": {"d": {"csv": f"{seed}.csv", "units": units}},
           "report": [{"table": "T", "data": "d", "rounding": numbers.choice(("exact", "printed")), "totals": lines,
                       "groups": [{"by": "Group", "totals": lines}]}],
           "output": [f"{seed}.txt"]}
    with open(folder / f"{seed}.csv", "w") as file:
        file.write(",".join(["Group"] + names) + "\n" + "".join(",".join(row) + "\n" for row in rows))
    with open(folder / f"{seed}.json", "w") as file:
        json.dump(job, file)
    return job, rows


def decimals_of(name, job):
    settings = job["settings"]
    return {"Length": settings["lengthDecimals"], "Angle": ANGLE_DECIMALS}.get(name, settings["numberDecimals"])


def ratio(index, job):
    name, _, units = COLUMNS[index]
    if units is None:
        return Fraction(1)
    key = name.lower()
    return units[job["data"]["d"]["units"][key]] / units[job["settings"][f"{key}Unit"]]


def expected(index, job, rows, printed, kind):
    """The digits of a total; nothing where there is none."""
    values = [(value(row[index + 1]), text) for row, text in zip(rows, printed) if row[index + 1]]
    if kind == "count":
        return str(len(values))
    if kind in ("min", "max"):  # as it is printed in its row
        return (min if kind == "min" else max)(values, key=lambda each: each[0])[1] if values else ""
    is_mean = kind == "mean"
    if job["report"][0]["rounding"] == "printed":
        total = Fraction(sum((Decimal(text) for _, text in values), Decimal(0)))
    else:
        total = sum((number for number, _ in values), Fraction(0)) * ratio(index, job)
    if is_mean:
        if not values:
            return ""
        total /= len(values)
    decimals = decimals_of(COLUMNS[index][0], job)
    rounded = round(abs(total) * 10 ** decimals)  # halves to even
    text = str(rounded).rjust(decimals + 1, "0")
    text = f"{text[:-decimals]}.{text[-decimals:]}" if decimals else text
    # Lengths have no sign before zeros alone; other numbers as printf writes them.
    return "-" + text if total < 0 and (rounded or COLUMNS[index][0] != "Length") else text


def check(folder, seed, job, rows):
    rows = sorted(rows, key=lambda row: row[0])
    shown = [[part.strip() for part in line.split("|")] for line in (folder / f"{seed}.txt").read_text().splitlines()]
    shown = [line for line in shown if len(line) == len(COLUMNS) + 1 and not line[1].startswith("-----")]
    shown = [line for line in shown if line[0] != "G"]
    printed = [line for line in shown if line[0].startswith("g")]
    totals = [line for line in shown if line[0] in KINDS]
    assert len(printed) == len(rows), f"{seed}: {len(printed)} rows"
    groups = [list(range(len(rows)))] if rows else []
    groups = [[i for i in range(len(rows)) if rows[i][0] == key] for key in sorted({row[0] for row in rows})] + groups
    assert len(totals) == len(KINDS) * len(groups), f"{seed}: {len(totals)} lines of totals"
    for number, group in enumerate(groups):
        for offset, kind in enumerate(KINDS.values()):
            line = totals[len(KINDS) * number + offset]
            for index, (name, _, _) in enumerate(COLUMNS):
                wanted = expected(index, job, [rows[i] for i in group], [printed[i][index + 1] for i in group], kind)
                assert line[index + 1] == wanted, f"{seed}: {kind} of {name}: {line[index + 1]}, not {wanted}"
    return len(KINDS) * len(COLUMNS) * len(groups)


def main():
    program = sys.argv[1]
    tables = int(sys.argv[2]) if len(sys.argv) > 2 else 3000
    with tempfile.TemporaryDirectory() as name:
        folder = Path(name)
        (folder / "t.xml").write_text(template())
        jobs = [write(folder, seed) for seed in range(tables)]
        subprocess.run([program, "render", "--quiet", *(f"{seed}.json" for seed in range(tables))], cwd=folder, check=True)
        count = sum(check(folder, seed, job, rows) for seed, (job, rows) in enumerate(jobs))
    print(f"{count} totals of {tables} tables")


if __name__ == "__main__":
    main()
