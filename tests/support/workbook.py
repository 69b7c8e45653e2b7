#!/usr/bin/env python3
"""Prints a workbook as JSON: its sheets with the cells that hold something, their types and number formats.

    workbook.py FILE

Only what Python itself brings is used. A sheet is {"name", "frozen", "filter", "widths", "repeated", "cells"}: the widths of
the columns in characters, and the rows that every sheet of paper has. A cell is [place, type, value, format] with the types
n (number), s (text) and f (formula).
"""
import json
import re
import sys
import xml.etree.ElementTree as xml
import zipfile

main = "{http://schemas.openxmlformats.org/spreadsheetml/2006/main}"


def text(value):
    value = re.sub(r"_x([0-9A-Fa-f]{4})_", lambda match: chr(int(match.group(1), 16)), value)
    return value


def formats(book):
    styles = xml.fromstring(book.read("xl/styles.xml"))
    codes = {0: "General", 1: "0", 2: "0.00", 49: "@"}
    for each in styles.iter(main + "numFmt"):
        codes[int(each.get("numFmtId"))] = each.get("formatCode")
    return [codes.get(int(each.get("numFmtId")), each.get("numFmtId")) for each in styles.find(main + "cellXfs")]


def sheet(book, number, name, codes, repeated):
    root = xml.fromstring(book.read(f"xl/worksheets/sheet{number}.xml"))
    cells = []
    for cell in root.iter(main + "c"):
        kind = cell.get("t", "n")
        if kind == "inlineStr":
            value, kind = text("".join(each.text or "" for each in cell.iter(main + "t"))), "s"
        elif cell.find(main + "v") is not None:
            value = cell.findtext(main + "v")
        else:
            continue
        if cell.find(main + "f") is not None:
            kind = "f"
            value = f"{cell.findtext(main + 'f')} = {value}"
        cells.append([cell.get("r"), kind, value, codes[int(cell.get("s", "0"))]])
    pane = root.find(f".//{main}pane")
    filtered = root.find(main + "autoFilter")
    return {"name": name, "frozen": pane.get("topLeftCell") if pane is not None else None,
            "filter": filtered.get("ref") if filtered is not None else None,
            "widths": " ".join(str(int(float(each.get("width")))) for each in root.iter(main + "col")
                               for _ in range(int(each.get("min")), int(each.get("max")) + 1)),
            "repeated": repeated.get(str(number - 1), ""), "cells": cells}


with zipfile.ZipFile(sys.argv[1]) as book:
    assert book.testzip() is None
    root = xml.fromstring(book.read("xl/workbook.xml"))
    names = [each.get("name") for each in root.iter(main + "sheet")]
    repeated = {each.get("localSheetId"): each.text for each in root.iter(main + "definedName")
                if each.get("name") == "_xlnm.Print_Titles"}
    codes = formats(book)
    core = xml.fromstring(book.read("docProps/core.xml"))
    properties = {each.tag.rsplit("}")[-1]: each.text for each in core}
    json.dump({"properties": properties,
               "sheets": [sheet(book, i + 1, name, codes, repeated) for i, name in enumerate(names)]}, sys.stdout)
