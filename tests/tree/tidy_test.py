"""Tests of the program that runs clang-tidy: tidy_test.py SCRIPT"""

import json
import os
import pathlib
import shutil
import subprocess
import sys
import tempfile
import unittest

SCRIPT = "scripts/tidy"
CHECKS = "Checks: '-*,modernize-use-nullptr,misc-unused-using-decls'\nWarningsAsErrors: '*'\nHeaderFilterRegex: '.*'\n"
CLEAN = "int *nothing() { return nullptr; }\n"
UNCLEAN = "int *nothing() { return 0; }\n"
# Runs the real program and writes down what for: a line for each compiler command of a source.
RECORDER = """#!/usr/bin/env python3
import json, os, sys
if "-p" in sys.argv:
    entries = json.load(open(sys.argv[sys.argv.index("-p") + 1] + "/compile_commands.json"))
    with open("{runs}", "a") as runs:
        runs.writelines(sys.argv[-1] + "\\n" for entry in entries if entry["file"] == sys.argv[-1])
os.execv("{program}", sys.argv)
"""


class Tidy(unittest.TestCase):
    """A made-up project with a copy of the script."""

    def setUp(self):
        self.folder = tempfile.TemporaryDirectory()
        self.root = pathlib.Path(self.folder.name).resolve()
        self.build = self.root / "build"
        self.commands = []
        for name in ("scripts", "src", "build", "bin"):
            (self.root / name).mkdir()
        shutil.copy(SCRIPT, self.root / "scripts/tidy")
        self.write(".clang-tidy", CHECKS)
        self.write("bin/clang-tidy", RECORDER.format(runs=self.root / "runs", program=shutil.which("clang-tidy")))
        (self.root / "bin/clang-tidy").chmod(0o755)

    def tearDown(self):
        self.folder.cleanup()

    def write(self, name, text):
        (self.root / name).write_text(text)

    def compiles(self, source, *flags):
        command = " ".join(["c++", *flags, "-o", f"{len(self.commands)}.o", "-c", f"{self.root}/{source}"])
        self.commands.append({"directory": str(self.build), "command": command, "file": f"{self.root}/{source}"})
        (self.build / "compile_commands.json").write_text(json.dumps(self.commands))

    def tidy(self):
        """Runs the script: its exit status, what it prints, and what it had looked at."""
        runs = self.root / "runs"
        runs.write_text("")
        environment = dict(os.environ, PATH=f"{self.root}/bin:{os.environ['PATH']}")
        done = subprocess.run([self.root / "scripts/tidy", self.build], env=environment, capture_output=True, text=True, check=False)
        looked = [pathlib.Path(line).name for line in runs.read_text().splitlines()]
        return done.returncode, done.stdout + done.stderr, looked

    def test_a_finding_fails_until_it_is_gone(self):
        self.write("src/a.cpp", UNCLEAN)
        self.compiles("src/a.cpp")
        for _ in range(2):
            status, output, _ = self.tidy()
            self.assertEqual(status, 1)
            self.assertIn("modernize-use-nullptr", output)
        self.write("src/a.cpp", CLEAN)
        self.assertEqual(self.tidy()[0], 0)

    def test_what_was_clean_is_looked_at_again_after_a_change_of_a_header(self):
        self.write("src/a.h", "int nothing();\n")
        self.write("src/a.cpp", '#include "a.h"\n')
        self.compiles("src/a.cpp")
        self.assertEqual(self.tidy()[2], ["a.cpp"])
        self.assertEqual(self.tidy()[2], [])
        self.write("src/a.h", UNCLEAN)
        status, _, looked = self.tidy()
        self.assertEqual((status, looked), (1, ["a.cpp"]))

    def test_programs_that_read_the_same_need_one_look(self):
        self.write("src/a.cpp", UNCLEAN)
        self.compiles("src/a.cpp", "-DFIRST", "-fPIC")
        self.compiles("src/a.cpp", "-DSECOND", "-fPIE", "-Isrc")
        status, _, looked = self.tidy()
        self.assertEqual((status, looked), (1, ["a.cpp"]))

    def test_each_macro_that_is_used_is_looked_at(self):
        self.write("src/a.h", f"#ifdef SECOND\n{UNCLEAN}#endif\n")
        self.write("src/a.cpp", '#include "a.h"\n')
        self.compiles("src/a.cpp", "-DFIRST")
        self.assertEqual(self.tidy()[0], 0)
        self.compiles("src/a.cpp", "-DSECOND")
        status, _, looked = self.tidy()
        self.assertEqual((status, looked), (1, ["a.cpp", "a.cpp"]))

    def test_each_header_of_the_same_name_is_looked_at(self):
        for name, text in (("one", CLEAN), ("two", UNCLEAN)):
            (self.root / name).mkdir()
            self.write(f"{name}/a.h", text)
        self.write("src/a.cpp", "#include <a.h>\n")
        self.compiles("src/a.cpp", f"-I{self.root}/one")
        self.assertEqual(self.tidy()[0], 0)
        self.compiles("src/a.cpp", f"-I{self.root}/two")
        self.assertEqual(self.tidy()[0], 1)


if __name__ == "__main__":
    SCRIPT = sys.argv.pop(1)
    unittest.main()
