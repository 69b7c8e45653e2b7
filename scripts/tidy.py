#!/usr/bin/env python3
"""Runs clang-tidy over the sources of folders, as scripts/check.sh tidy asks for.

    scripts/tidy.py --jobs N FOLDER...

A source that was found clean is not read again while nothing that is compiled with it changes, so that a run that was
stopped goes on where it was. Exit status 1 when something was found.
"""
import argparse
import concurrent.futures
import hashlib
import json
import pathlib
import shlex
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
BUILD = ROOT / "build/tidy"
CLEAN = BUILD / "clean"


def add_example(database):
    """The example host is built by its own project: it is read with the options of a program that sees the same headers."""
    entries = json.loads(database.read_text())
    example = str(ROOT / "examples/host/main.cpp")
    if all(entry["file"] != example for entry in entries):
        like = next(entry for entry in entries if entry["file"] == str(ROOT / "tools/pictures/main.cpp"))
        command = like["command"].replace(like["file"], example).replace(" -c ", r' -DHOST_TEMPLATES=\"\" -c ')
        entries.append({**like, "file": example, "command": command})
        database.write_text(json.dumps(entries, indent=0))
    return entries


def of_folder(entries, folder):
    """The entries of a folder's sources. Test files are read in the files that include several of them, as most of the
    time goes into reading headers."""
    found = {}
    for entry in entries:
        path = pathlib.Path(entry["file"])
        name = path.relative_to(BUILD if path.is_relative_to(BUILD) else ROOT).as_posix()
        generated = "cmake_pch" in name or "qrc_" in name or "verify_interface" in name
        if not generated and (name + "/").startswith(folder + "/"):
            found[entry["file"]] = entry
    return [found[file] for file in sorted(found)]


def key_of(entry, tools):
    """Stands for all that the compiler reads, comments too, as they can switch a check off."""
    arguments = shlex.split(entry["command"])
    arguments = arguments[next(i for i, one in enumerate(arguments) if one.endswith("clang++")):]
    del arguments[arguments.index("-o"):arguments.index("-o") + 2]
    made = subprocess.run([*arguments, "-E", "-CC"], cwd=entry["directory"], capture_output=True, check=False)
    return None if made.returncode else hashlib.sha256(tools + made.stdout).hexdigest()


def check(entry, tools):
    """@return what clang-tidy has found; empty when nothing"""
    key = key_of(entry, tools)
    if key and (CLEAN / key).exists():
        return ""
    run = subprocess.run(["clang-tidy", "-p", BUILD, "--quiet", "--warnings-as-errors=*", entry["file"]],
                         capture_output=True, text=True, check=False)
    if run.returncode == 0:
        if key:
            (CLEAN / key).touch()
        return ""
    # On standard error it counts what it does not show.
    errors = [line for line in run.stderr.splitlines() if "error:" in line or "Error" in line]
    return run.stdout + "\n".join(errors) or f"{entry['file']}: clang-tidy ended with {run.returncode}"


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--jobs", type=int, default=1)
    parser.add_argument("folders", nargs="+")
    options = parser.parse_args()
    CLEAN.mkdir(parents=True, exist_ok=True)
    tools = subprocess.run(["clang-tidy", "--version"], capture_output=True, check=True).stdout
    tools += (ROOT / ".clang-tidy").read_bytes()
    entries = add_example(BUILD / "compile_commands.json")
    status = 0
    with concurrent.futures.ThreadPoolExecutor(options.jobs) as pool:
        for folder in options.folders:
            chosen = of_folder(entries, folder)
            print(f"clang-tidy: {folder} ({len(chosen)} files)" if chosen else f"clang-tidy: {folder}: nothing of it is built",
                  flush=True)
            for found in pool.map(lambda entry: check(entry, tools), chosen):
                if found:
                    print(found, flush=True)
                    status = 1
    return status


if __name__ == "__main__":
    sys.exit(main())
