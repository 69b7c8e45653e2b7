#!/usr/bin/env python3
"""What scripts/tidy.py reads together, again and not again, in a small tree with a clang-tidy that finds the word BAD; and what
the real one finds in sources that are read together, where it is installed.
"""
import json
import os
import pathlib
import shutil
import subprocess
import tempfile
import unittest

SCRIPT = pathlib.Path(__file__).resolve().parent.parent / "scripts/tidy.py"
PAGE = {
    "page/A.h": "int a();\n",
    "page/A.cpp": '#include "A.h"\n\nint a()\n{\n    return 1;\n}\n',
    "page/B.cpp": '#include "A.h"\n\nint b()\n{\n    return a();\n}\n',
    "page/C.cpp": "int c()\n{\n    return 3;\n}\n",
    "tools/pictures/main.cpp": "int main()\n{\n}\n",
}
CLANG_TIDY = r'''#!/usr/bin/env python3
import re, sys, os
if "--version" in sys.argv:
    sys.exit(print(open("VERSION").read()))
start = sys.argv[sys.argv.index("--") - 1]
options = sys.argv[sys.argv.index("--") + 1:]
open("OPTIONS", "w").write(" ".join(option for option in options if not option.startswith("-iquote")))
text = open(start).read()
files = re.findall("^// (/.*[.]cpp)$", text, re.MULTILINE) or [start]
with open("READ", "a") as log:
    log.write(" ".join(sorted(os.path.relpath(file) for file in files)) + "\n")
folders = [option[len("-iquote"):] for option in options if option.startswith("-iquote")] or [os.path.dirname(start)]
included = re.findall('^#include "(.*)"', text, re.MULTILINE)
status = 0 if len(included) == len(set(included)) else 1
for name in included:
    path = [f"{folder}/{name}" for folder in folders if os.path.exists(f"{folder}/{name}")][0]
    if "BAD" in open(path).read():
        print(f"{path}:1:1: error: BAD")
        status = 1
for number, line in enumerate(text.splitlines(), 1):
    if "BAD" in line or "ALONE" in line and text.count("ALONE") > 1:
        print(f"{start}:{number}:1: error: {line}")
        status = 1
print("3 errors generated.", file=sys.stderr)
sys.exit(status)
'''


class Tidy(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.root = pathlib.Path(folder.name).resolve()
        self.write("scripts/tidy.py", SCRIPT.read_text())
        self.write("bin/clang-tidy", CLANG_TIDY)
        self.write("bin/dpkg-query", "#!/bin/sh\ncat INSTALLED\n")
        self.write("bin/clang++", "#!/bin/sh\nfor last; do :; done\ntouch \"$last\"\n")
        self.write("scripts/tidy-scope.cpp", "")
        for name in ("scripts/tidy.py", "bin/clang-tidy", "bin/dpkg-query", "bin/clang++"):
            (self.root / name).chmod(0o755)
        for name in ("INSTALLED", "VERSION", ".clang-tidy"):
            self.write(name, "1")
        self.path = f"{self.root}/bin:{os.environ['PATH']}"
        self.options = {}
        self.compiled = [name for name in PAGE if name.endswith(".cpp")]
        for name, text in PAGE.items():
            self.write(name, text)

    def write(self, name, text):
        path = self.root / name
        path.parent.mkdir(parents=True, exist_ok=True)
        path.write_text(text)

    def run_over(self, *folders):
        """@return the exit status, what is said of mistakes, and what was read together"""
        entries = [{"directory": str(self.root), "file": str(self.root / name),
                    "command": f"ccache /usr/bin/clang++ {self.options.get(name, '-O2')} -o {name}.o -c {self.root / name}"}
                   for name in self.compiled]
        self.write("build/tidy/compile_commands.json", json.dumps(entries))
        (self.root / "READ").unlink(missing_ok=True)
        (self.root / "READ").touch()
        run = subprocess.run([self.root / "scripts/tidy.py", *(folders or ["page"])], cwd=self.root, text=True,
                             env={**os.environ, "PATH": self.path}, capture_output=True, check=False)
        self.assertEqual(run.stderr, "")
        said = [line.removeprefix(f"{self.root}/") for line in run.stdout.splitlines() if " error: " in line]
        return run.returncode, said, (self.root / "READ").read_text().splitlines()

    def test_files_are_read_together(self):
        self.assertEqual(self.run_over(), (0, [], ["page/A.cpp page/B.cpp page/C.cpp"]))
        self.assertEqual(list((self.root / "build/tidy/read").iterdir()), [])

    def test_what_is_clean_is_not_read_again(self):
        self.run_over()
        self.assertEqual(self.run_over(), (0, [], []))

    def test_what_reads_a_changed_file_is_read_again(self):
        for name, again in (("page/C.cpp", "page/C.cpp"), ("page/A.h", "page/A.cpp page/B.cpp"),
                            (".clang-tidy", "page/A.cpp page/B.cpp page/C.cpp"), ("VERSION", "page/A.cpp page/B.cpp page/C.cpp"),
                            ("INSTALLED", "page/A.cpp page/B.cpp page/C.cpp"),
                            ("scripts/tidy-scope.cpp", "page/A.cpp page/B.cpp page/C.cpp")):
            with self.subTest(name):
                self.run_over()
                self.write(name, (self.root / name).read_text() + "// a comment\n")
                self.assertEqual(self.run_over(), (0, [], [again]))

    def test_options_that_mean_something_else_are_read_apart(self):
        for options, apart in (("-DA=2", True), ("-DB=1", False), ("-Wextra", True), ("-O0 -g1 -fPIE", False),
                               ("-DA=1 -I/b -isystem /c", False), ("-DA=2 -UA", False)):
            with self.subTest(options):
                self.options = {"page/A.cpp": "-DA=1 -O2", "page/B.cpp": options, "page/C.cpp": "-I/a"}
                self.assertEqual(len(self.run_over()[2]), 2 if apart else 1)
                shutil.rmtree(self.root / "build/tidy/clean")

    def test_files_that_are_read_together_have_all_options(self):
        self.options = {"page/A.cpp": "-DA=1 -I/a -Wall", "page/B.cpp": "-DB -isystem /b -Wall", "page/C.cpp": "-I/a -Wall"}
        self.run_over()
        self.assertEqual((self.root / "OPTIONS").read_text(), "-DA=1 -DB -I/a -isystem/b -Wall -fPIC")

    def test_other_options_are_read_again(self):
        self.run_over()
        self.options["page/B.cpp"] = "-DB"
        self.assertEqual(self.run_over()[2], ["page/B.cpp"])

    def test_equal_names_are_read_apart(self):
        for of_c, of_b in (("int same()\n{\n", "void *same(int number)\n{\n"), ("struct Same\n{\n", "class Same : A\n{\n"),
                           ("constexpr int same = 1;\n", "int b()\n{\n    int same = 2;\n"), ("int same[] = {\n", "int same{0};\n"),
                           ("#define SAME 1\n", "#define SAME 2\n"), ("using Same = int;\n", "enum class Same\n{\n")):
            with self.subTest(of_b):
                self.write("page/C.cpp", of_c)
                self.write("page/B.cpp", of_b)
                self.assertEqual(sorted(self.run_over()[2])[-1], "page/C.cpp")
                shutil.rmtree(self.root / "build/tidy/clean")

    def test_large_files_are_read_apart(self):
        self.write("page/B.cpp", "// " + "long " * 20_000)
        self.write("page/C.cpp", "// " + "long " * 20_000)
        self.assertEqual(sorted(self.run_over()[2]), ["page/A.cpp page/B.cpp", "page/C.cpp"])

    def test_a_mistake_is_said_where_it_is(self):
        self.write("page/B.cpp", "int b()\n{\n    BAD\n}\n")
        wrong = ["page/B.cpp:3:1: error:     BAD"]
        self.assertEqual(self.run_over(), (1, wrong, ["page/A.cpp page/B.cpp page/C.cpp", "page/B.cpp", "page/A.cpp page/C.cpp"]))
        self.assertEqual(self.run_over(), (1, wrong, ["page/B.cpp"]))

    def test_a_mistake_in_a_header_is_said(self):
        self.write("page/A.h", "BAD\n")
        self.assertEqual(self.run_over(), (1, ["page/A.h:1:1: error: BAD"], ["page/A.cpp page/B.cpp page/C.cpp"]))

    def test_what_is_wrong_only_together_is_not_said(self):
        self.write("page/A.cpp", "// ALONE\n")
        self.write("page/B.cpp", "// ALONE\n")
        self.assertEqual(self.run_over()[:2], (0, []))
        self.assertEqual(self.run_over(), (0, [], []))

    def test_test_files_are_those_of_the_files_that_include_them(self):
        for number, (name, end) in enumerate((("A", "BAD"), ("B", "// good"))):
            self.write(f"tests/page/{name}Test.cpp", f"int test()\n{{\n}}\n{end}\n")
            self.compiled.append(f"build/tidy/tests/page/batch{number}.cpp")
            self.write(self.compiled[-1], f'#include "{self.root}/tests/page/{name}Test.cpp"\n')
        status, said, files = self.run_over("tests")
        self.assertEqual((status, said), (1, ["tests/page/ATest.cpp:4:1: error: BAD"]))
        batches = [f"build/tidy/tests/page/batch{number}.cpp" for number in range(2)]
        self.assertEqual(files, [" ".join(batches), *batches])

    @unittest.skipUnless(shutil.which("clang-tidy"), "clang-tidy is not installed")
    def test_clang_tidy_finds_the_same_in_files_that_are_read_together(self):
        self.path = os.environ["PATH"]
        for name in (".clang-tidy", "scripts/tidy-scope.cpp"):
            self.write(name, (SCRIPT.parent.parent / name).read_text())
        self.write("page/A.h", "#pragma once\n#include <string>\ninline int *none() { return 0; }\n")
        self.write("page/A.cpp", """#include "A.h"
namespace
{
int valueOf(const int *place)
{
    if (place == nullptr) {
        return *place;
    }
    return 1;
}
}
int a(const int *place) { return valueOf(place); }
""")
        self.write("page/B.cpp", """#include "A.h"
#include <utility>
std::size_t b(std::string text)
{
    const std::string other = std::move(text);
    return text.size() + other.size();
}
""")
        status, said, _ = self.run_over()
        found = {line.split(" ")[0] + line[line.rindex("["):].replace(",-warnings-as-errors", "") for line in said}
        self.assertEqual(status, 1)
        self.assertEqual(found, {"page/A.h:3:29:[modernize-use-nullptr]",
                                 "page/A.cpp:7:16:[clang-analyzer-core.NullDereference]",
                                 "page/B.cpp:6:12:[bugprone-use-after-move]",
                                 "page/B.cpp:6:12:[clang-analyzer-cplusplus.Move]"})


if __name__ == "__main__":
    unittest.main()
