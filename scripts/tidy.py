#!/usr/bin/env python3
"""Runs clang-tidy over the sources of folders, as scripts/check.sh tidy asks for.

    scripts/tidy.py --jobs N FOLDER...

Most of the time goes into the headers of Qt and of the standard library. So a plugin (tidy-scope.cpp) keeps the checks out of
them, and many sources are read at a time, one after the other in one file. What is found in such a file is looked for again
in each source that it names alone, and said as it is there.

A source that was found clean is not read again while it, the headers of the project that it includes, its options, clang-tidy
and the installed headers stay the same. So a run that was stopped goes on where it was. Exit status 1 when something was found.
"""
import argparse
import concurrent.futures
import functools
import hashlib
import json
import os
import pathlib
import re
import shlex
import shutil
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
BUILD = ROOT / "build/tidy"
CLEAN = BUILD / "clean"
# Bytes of sources that are read as one file. More costs memory, and reading more again when one of them is wrong.
MOST = 120_000

# Options that change the code and not what the sources mean.
CODE = re.compile(r"-(O.*|g.*|f(PI[CE]|visibility.*|pch-.*|no-semantic-interposition|stack-.*|cf-protection.*)"
                  r"|[DU]_FORTIFY_SOURCE.*|Winvalid-pch)")
INCLUDE = re.compile(r'^[ \t]*#[ \t]*include[ \t]*(["<])([^">\n]+)[">]', re.MULTILINE)
# What begins a line outside of classes and functions.
TYPE = re.compile(r"^(?:class|struct|union|enum(?: class)?|using|#define) (\w+)(?!.*;)", re.MULTILINE)
ALIAS = re.compile(r"^using (\w+) =", re.MULTILINE)
FUNCTION = re.compile(r"^\w[^(={;\n]*?[ *&](\w+)\(", re.MULTILINE)
VARIABLE = re.compile(r"^(?!using |namespace )\w[^(={;\n]*?[ *&](\w+)(?:\[[^\]\n]*\])*(?: = |\{|;| =$)", re.MULTILINE)
FOUND = re.compile(r"^(/[^:\n]+):\d+:\d+: (?:warning|error): ", re.MULTILINE)


@functools.lru_cache(maxsize=None)
def text_of(path):
    return pathlib.Path(path).read_text(errors="replace")


@functools.lru_cache(maxsize=None)
def hash_of(path):
    return hashlib.sha256(text_of(path).encode()).hexdigest()


@functools.lru_cache(maxsize=None)
def included_by(path, folders):
    """The files of the project that a file includes. @param folders  where they are looked for"""
    found = []
    for kind, name in INCLUDE.findall(text_of(path)):
        for folder in ((os.path.dirname(path),) if kind == '"' else ()) + folders:
            file = os.path.normpath(os.path.join(folder, name))
            if file.startswith(f"{ROOT}/") and os.path.isfile(file):
                found.append(file)
                break
    return found


class Options:
    """What a source is compiled with, as far as it matters here."""

    def __init__(self, arguments):
        self.others = []
        self.folders = [] # with the option before each
        self.macros = {}
        arguments = iter(arguments)
        for argument in arguments:
            if argument in ("-o", "-c"):
                next(arguments)
            elif argument.startswith("-I") or argument == "-isystem":
                folder = next(arguments) if argument == "-isystem" else argument[2:]
                self.folders.append((argument[:2] if argument[1] == "I" else argument, folder))
            elif argument.startswith("-D"):
                name, _, value = argument[2:].partition("=")
                self.macros[name] = value
            elif argument.startswith("-U"):
                self.macros.pop(argument[2:], None)
            elif not CODE.fullmatch(argument):
                self.others.append(argument)
        self.macros.pop("_FORTIFY_SOURCE", None)

    def fits(self, other):
        common = self.macros.keys() & other.macros.keys()
        return self.others == other.others and all(self.macros[name] == other.macros[name] for name in common)

    def add(self, other):
        """Headers have names of their own, so that no folder more makes a file include another one."""
        self.folders += [folder for folder in other.folders if folder not in self.folders]
        self.macros |= other.macros

    def arguments(self):
        folders = [option + folder for option, folder in self.folders]
        macros = [f"-D{name}={value}" if value else f"-D{name}" for name, value in self.macros.items()]
        return [*macros, *folders, *self.others, "-fPIC"] # which Qt asks for


class Source:
    """A file that is compiled, with its options."""

    def __init__(self, entry):
        self.path = entry["file"]
        self.directory = entry["directory"]
        arguments = shlex.split(entry["command"])
        self.options = Options(arguments[next(i for i, one in enumerate(arguments) if one.endswith("clang++")) + 1:])
        self.folders = tuple(folder for _, folder in self.options.folders)
        # Test files are compiled in files that include several of them already.
        self.files = [self.path] + [file for file in included_by(self.path, self.folders) if file.endswith(".cpp")]
        self.size = sum(len(text_of(file)) for file in self.files)

    def key(self, tools):
        """Changes with all that clang-tidy reads, comments too, as they can switch a check off."""
        files = {self.path}
        unread = [self.path]
        while unread:
            for file in included_by(unread.pop(), self.folders):
                if file not in files:
                    files.add(file)
                    unread.append(file)
        parts = [tools, self.directory, *self.options.arguments(), *(f"{file} {hash_of(file)}" for file in sorted(files))]
        return hashlib.sha256("\0".join(parts).encode()).hexdigest()

    @functools.cached_property
    def names(self):
        """What it declares outside of classes, which another file in the same translation unit must not declare as well."""
        text = text_of(self.path)
        return {name for form in (TYPE, ALIAS, FUNCTION) for name in form.findall(text)} | self.variables

    @functools.cached_property
    def variables(self):
        return set(VARIABLE.findall(text_of(self.path)))

    @functools.cached_property
    def words(self):
        return set(re.findall(r"\w+", text_of(self.path)))

    def fits(self, other):
        """Whether both can be one translation unit. A local name may not hide a variable of the other file."""
        return (self.names.isdisjoint(other.names) and self.variables.isdisjoint(other.words)
                and other.variables.isdisjoint(self.words))


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
    """The sources of a folder. Test files come in the files that include several of them."""
    found = {}
    for entry in entries:
        path = pathlib.Path(entry["file"])
        name = path.relative_to(BUILD if path.is_relative_to(BUILD) else ROOT).as_posix()
        generated = "cmake_pch" in name or "qrc_" in name or "verify_interface" in name
        if not generated and (name + "/").startswith(folder + "/"):
            found[entry["file"]] = entry
    return [Source(found[file]) for file in sorted(found)]


def batches_of(sources):
    """Sources that are read together."""
    batches = []
    for source in sources:
        for batch in batches:
            if (all(source.options.fits(one.options) for one in batch) and sum(one.size for one in batch) + source.size <= MOST
                    and all(source.fits(one) for one in batch)):
                batch.append(source)
                break
        else:
            batches.append([source])
    return batches


def made_plugin():
    """@return the plugin that keeps the checks out of the headers of the system"""
    source = ROOT / "scripts/tidy-scope.cpp"
    made = BUILD / f"scope-{hash_of(str(source))[:16]}.so"
    if not made.exists():
        headers = pathlib.Path(os.path.realpath(shutil.which("clang-tidy"))).parent.parent / "include"
        subprocess.run(["clang++", "-std=c++17", "-O1", "-fPIC", "-fno-rtti", "-shared", "-isystem", str(headers), str(source),
                        "-o", str(made)], check=True)
    return made


def lines_of(path, seen):
    """The lines of a source, with those of the sources that it includes, each with its file and number.

    @param seen  headers that are included already: to include one again would be a finding
    """
    included = [name for _, name in INCLUDE.findall(text_of(path))]
    for number, line in enumerate(text_of(path).splitlines(), 1):
        match = INCLUDE.match(line)
        if match and match[2].endswith(".cpp"):
            yield from lines_of(match[2], seen)
            continue
        if match and match[2] in seen and included.count(match[2]) == 1:
            line = ""
        elif match:
            seen.add(match[2])
        yield path, number, line


def read(sources, plugin):
    """@return what clang-tidy says of sources that are read together; empty when it finds nothing"""
    options = Options([])
    options.others = sources[0].options.others
    for source in sources:
        options.add(source.options)
    path = pathlib.Path(sources[0].path)
    arguments = options.arguments()
    lines = []
    if len(sources) > 1 or len(sources[0].files) > 1:
        # Not by #include: calls are followed in the main file alone.
        seen = set()
        for source in sources:
            lines += [(source.path, 1, f"// {source.path}"), *lines_of(source.path, seen)]
        text = "".join(f"{line}\n" for _, _, line in lines)
        path = BUILD / "read" / (hashlib.sha256(text.encode()).hexdigest()[:16] + ".cpp")
        path.parent.mkdir(exist_ok=True)
        path.write_text(text)
        arguments += [f"-iquote{folder}" for folder in sorted({os.path.dirname(file) for file, _, _ in lines})]
    run = subprocess.run(["clang-tidy", f"--load={plugin}", "--quiet", "--warnings-as-errors=*", str(path), "--", *arguments],
                         cwd=sources[0].directory, capture_output=True, text=True, check=False)
    if lines:
        path.unlink()
    if run.returncode == 0:
        return ""
    # On standard error it counts what it does not show.
    errors = [line for line in run.stderr.splitlines() if "error:" in line or "Error" in line]
    said = run.stdout + "\n".join(errors) or f"{path}: clang-tidy ended with {run.returncode}"
    return re.sub(rf"^{re.escape(str(path))}:(\d+):", lambda place: "{}:{}:".format(*lines[int(place[1]) - 1]) if lines
                  else place[0], said, flags=re.MULTILINE)


def check(sources, tools, plugin):
    """@return what is found in sources that are read together; empty when nothing"""
    said = read(sources, plugin)
    if not said:
        for source in sources:
            (CLEAN / source.key(tools)).touch()
        return ""
    if len(sources) == 1:
        return said
    # Together they may not compile, or one may hide what another declares: what a source is charged with counts when it is
    # found in it alone.
    named = set(FOUND.findall(said))
    alone = [source for source in sources if not named.isdisjoint(source.files)]
    if not alone:
        if named: # a header
            return said
        alone = sources
    rest = [source for source in sources if source not in alone]
    groups = [[source] for source in alone] + ([rest] if rest else [])
    return "".join(check(group, tools, plugin) for group in groups)


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--jobs", type=int, default=1)
    parser.add_argument("folders", nargs="+")
    chosen = parser.parse_args()
    CLEAN.mkdir(parents=True, exist_ok=True)
    tools = "".join(subprocess.run(command, capture_output=True, text=True, check=True).stdout
                    for command in (["clang-tidy", "--version"], ["dpkg-query", "-W", "*-dev"]))
    tools += (ROOT / ".clang-tidy").read_text()
    plugin = made_plugin()
    tools += plugin.name
    entries = add_example(BUILD / "compile_commands.json")
    waiting = []
    for folder in chosen.folders:
        sources = of_folder(entries, folder)
        unread = [source for source in sources if not (CLEAN / source.key(tools)).exists()]
        print(f"clang-tidy: {folder} ({len(sources)} files, {len(unread)} to read)" if sources else
              f"clang-tidy: {folder}: nothing of it is built", flush=True)
        waiting += unread
    batches = batches_of(waiting)
    status = 0
    with concurrent.futures.ThreadPoolExecutor(chosen.jobs) as pool:
        read_now = {pool.submit(check, batch, tools, plugin): batch for batch in batches}
        for number, done in enumerate(concurrent.futures.as_completed(read_now), 1):
            first = os.path.relpath(read_now[done][0].path, ROOT)
            print(f"clang-tidy: {number} of {len(batches)}: {first} and {len(read_now[done]) - 1} more", flush=True)
            if done.result():
                print(done.result(), flush=True)
                status = 1
    return status


if __name__ == "__main__":
    sys.exit(main())
