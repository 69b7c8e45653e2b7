#!/usr/bin/python3
"""Compares the first sheet of a workbook with the same table as a report prints it.

    compare-workbook.py BOOK.xlsx PRINTED.csv OFFICE.csv

The workbook is read by openpyxl, and each number is formatted here as its number format says; OFFICE.csv is what an office
shows of it. A cell with nothing stands for a value that is missing. Prints each difference; exit status 1 when there is one.
"""
import csv
import decimal
import re
import sys

import openpyxl


def section(code, value):
    """The part of a number format that counts, and whether it shows the sign by itself."""
    parts = code.split(";")
    if len(parts) == 1:
        return parts[0], value < 0
    return (parts[0] if value > 0 else parts[1] if value < 0 else parts[2]), False


def formatted(value, code):
    part, is_minus = section(code, value)
    quoted = re.findall(r'"([^"]*)"', part)
    front = quoted[0] if part.startswith('"') else ""
    back = quoted[-1] if part.endswith('"') else ""
    digits = re.sub(r'"[^"]*"', "", part)
    sign = digits[0] if digits[0] in "+-" else ""
    digits = digits[len(sign):]
    decimals = len(digits.split(".")[1]) if "." in digits else 0
    number = abs(decimal.Decimal(repr(value))).quantize(decimal.Decimal(1).scaleb(-decimals), decimal.ROUND_HALF_UP)
    text = f"{number:f}"
    if "+" in digits:
        grouped = len(digits.split("+")[1].split(".")[0])
        whole, point, rest = text.partition(".")
        whole = whole.zfill(grouped + 1)
        text = whole[:-grouped] + "+" + whole[-grouped:] + point + rest
    return ("-" if is_minus else "") + front + sign + text + back


decimal.getcontext().prec = 60
book = openpyxl.load_workbook(sys.argv[1])
with open(sys.argv[2], newline="", encoding="utf-8") as file:
    printed = list(csv.reader(file))
with open(sys.argv[3], newline="", encoding="utf-8") as file:
    office = list(csv.reader(file))
rows = list(book.worksheets[0].iter_rows())
wrong = numbers = 0
if len(rows) != len(printed):
    print(f"{len(rows)} rows, {len(printed)} printed")
    wrong += 1
for row, cells in enumerate(rows[1:], 1):
    for column, cell in enumerate(cells):
        if cell.data_type == "f":
            print(f"{cell.coordinate} is a formula")
            wrong += 1
        if cell.data_type != "n" or cell.value is None:
            continue
        numbers += 1
        expected = printed[row][column]
        shown = formatted(cell.value, cell.number_format)
        in_office = office[row][column] if column < len(office[row]) else ""
        if shown != expected or in_office != expected:
            print(f"{cell.coordinate}: {cell.value!r} as {cell.number_format}: {shown}, in the office {in_office}, "
                  f"printed {expected}")
            wrong += 1
print(f"{numbers} numbers")
sys.exit(1 if wrong or numbers == 0 else 0)
