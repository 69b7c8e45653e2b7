#!/usr/bin/env python3
"""Brings the translation files up to date with the texts of the sources.

    scripts/update-translations.py           adds new texts, takes out those that are gone, keeps translations
    scripts/update-translations.py --check   says what is missing or out of date; exit status 1 when something is

Texts are in Xlate("...") or QT_TRANSLATE_NOOP("KaReport", "..."). What follows "@@" in a text is a note for the
translator. The files are Qt's (.ts): they open in Qt Linguist.
"""
import pathlib
import re
import sys
import xml.etree.ElementTree as xml
from xml.sax.saxutils import escape

root = pathlib.Path(__file__).resolve().parent.parent
folders = ["host", "templates", "groups", "page", "formats", "report", "print", "view", "ui", "sources", "rows", "exports", "jobs", "sheets", "preview", "apps"]
languages = ["de", "ja"]
literal = r'"(?:[^"\\\n]|\\.)*"'
call = re.compile(r'(?:\bXlate\(|\bQT_TRANSLATE_NOOP\(\s*"KaReport"\s*,)\s*((?:' + literal + r'\s*)+)\)')
escapes = {"n": "\n", "t": "\t", '"': '"', "\\": "\\", "r": "\r"}


def unquoted(literals):
    pieces = re.findall(literal, literals)
    return "".join(re.sub(r"\\(.)", lambda m: escapes[m.group(1)], piece[1:-1]) for piece in pieces)


def texts():
    """All texts with their notes, in the order of files and places."""
    found = {}
    for folder in folders:
        for path in sorted((root / folder).rglob("*")):
            if path.suffix in (".cpp", ".h"):
                for match in call.finditer(path.read_text(encoding="utf-8")):
                    source, _, note = unquoted(match.group(1)).partition("@@")
                    found.setdefault((source, note), path.relative_to(root).as_posix())
    return found


def translations(path):
    if not path.exists():
        return {}
    kept = {}
    for message in xml.parse(path).getroot().iter("message"):
        translation = message.find("translation")
        if translation is not None and translation.get("type") is None and translation.text:
            kept[(message.findtext("source"), message.findtext("comment", ""))] = translation.text
    return kept


def placeholders(text):
    return sorted(re.findall(r"%\d", text))


def written(language, found, kept):
    lines = ['<?xml version="1.0" encoding="utf-8"?>', "<!DOCTYPE TS>",
             f'<TS version="2.1" language="{language}" sourcelanguage="en">', "<context>", "    <name>KaReport</name>"]
    for (source, note), place in found.items():
        lines += ["    <message>", f'        <location filename="../{place}"/>',
                  f"        <source>{escape(source)}</source>"]
        if note:
            lines.append(f"        <comment>{escape(note)}</comment>")
        translation = kept.get((source, note))
        lines.append(f"        <translation>{escape(translation)}</translation>" if translation
                     else '        <translation type="unfinished"></translation>')
        lines.append("    </message>")
    return "\n".join(lines + ["</context>", "</TS>", ""])


def main():
    found = texts()
    wrong = []
    for language in languages:
        path = root / "translations" / f"kareport_{language}.ts"
        kept = translations(path)
        text = written(language, found, kept)
        name = path.relative_to(root)
        for source, note in found:
            translation = kept.get((source, note))
            if translation is None:
                wrong.append(f"{name}: not translated: {source!r}")
            elif placeholders(source) != placeholders(translation):
                wrong.append(f"{name}: other placeholders than the text: {source!r}")
            elif source.count("|") != translation.count("|"):
                wrong.append(f"{name}: another number of parts than the text: {source!r}")
            elif (source != source.strip(" ")) != (translation != translation.strip(" ")):
                wrong.append(f"{name}: blanks at the ends differ: {source!r}")
        if "--check" not in sys.argv[1:]:
            path.write_text(text, encoding="utf-8")
        elif not path.exists() or path.read_text(encoding="utf-8") != text:
            wrong.append(f"{name}: out of date: scripts/update-translations.py brings it up to date")
    print("\n".join(wrong))
    return 1 if wrong and "--check" in sys.argv[1:] else 0


sys.exit(main())
