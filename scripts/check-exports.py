#!/usr/bin/env python3
"""Says where a shared library and the headers that are installed for it differ: a symbol that is offered without being
declared there, or a function that is declared and not offered. Prints one line for each; exit status 1 when there is one.

    scripts/check-exports.py HEADERS LIBRARY...

HEADERS is the folder of the installed headers. What the compiler makes of the standard library and of Qt in passing is
not part of an interface and is skipped.
"""

import pathlib
import re
import subprocess
import sys

MARK = "KAREPORT_EXPORT"
# What a mangled name begins with, up to the name of the class or function: what it is of a class (a table, a thunk, a guard),
# that it is nested, and our namespace.
BEGIN = re.compile(r"_Z(?:T[VIST]|Thn?\d+_|Tvn?\d+_n?\d+_|GV|Z)*(?:N[rVK]*)?(?:8kareport)?(\d+)")
LINKERS = {"_init", "_fini", "_edata", "_end", "__bss_start"}


def declared(folder):
    """The names of classes and of functions that the headers mark."""
    classes, functions = set(), set()
    for header in sorted(folder.glob("*.h")):
        text = re.sub(r"//.*", "", header.read_text(encoding="utf-8"))
        classes.update(re.findall(rf"\b(?:class|struct)\s+{MARK}\s+(\w+)", text))
        functions.update(re.findall(rf"^{MARK}\s+(?!class|struct)[^;({{]*?(\w+)\s*\(", text, re.M))
    return classes, functions


def offered(library):
    """The symbols that a library offers: the name of the class or function that each is of, and how a person reads it."""
    listing = subprocess.run(
        ["nm", "-D", "--defined-only", "--format=just-symbols", str(library)], check=True, capture_output=True, text=True
    ).stdout
    readable = subprocess.run(["c++filt"], input=listing, check=True, capture_output=True, text=True).stdout
    for symbol, text in zip(listing.splitlines(), readable.splitlines()):
        found = BEGIN.match(symbol)
        if found:
            name = symbol[found.end() : found.end() + int(found.group(1))]
            if not re.match(r"[Qq][A-Z]|__", name):
                yield name, text
        elif not symbol.startswith("_Z") and symbol not in LINKERS:
            yield symbol, text
        # All others are of the standard library (_ZSt, _ZNSt) or operators without a class of ours.


def main():
    if len(sys.argv) < 3:
        sys.exit("usage: check-exports.py HEADERS LIBRARY...")
    folder = pathlib.Path(sys.argv[1])
    classes, functions = declared(folder)
    if not classes or not functions:
        sys.exit(f"{folder}: no header there marks anything with {MARK}")
    wrong = []
    names = set()
    for library in sys.argv[2:]:
        for name, text in offered(library):
            names.add(name)
            if name not in classes | functions:
                wrong.append(f"{library}: {text} is offered, and no installed header declares it")
    wrong += [f"{folder}: {name} is declared, and no library offers it" for name in sorted(functions - names)]
    wrong += [f"{folder}: class {name} is declared, and no library offers any of it" for name in sorted(classes - names)]
    print("\n".join(wrong), end="\n" if wrong else "")
    sys.exit(1 if wrong else 0)


if __name__ == "__main__":
    main()
