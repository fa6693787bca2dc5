# SPDX-License-Identifier: Apache-2.0
"""Every option that --help names has its place in the manual, and the manuals read without complaint."""

import os
import re
import unittest

from packaging_support import BUILD, PROGRAMS, SOURCES, needs, run

OPTION = re.compile(r"^  (-[^ ]+)", re.MULTILINE)
VERB = re.compile(r"^  (\w[\w-]*) {2,}", re.MULTILINE)


def help_of(program, *verb):
    return run(PROGRAMS[program], *verb, "--help").stdout


def options(text):
    """"-h,--help" and "--format" of the lines that name options."""
    return [name for names in OPTION.findall(text) for name in names.split(",")]


def verbs(program):
    return VERB.findall(help_of(program).partition("\nSubcommands:\n")[2])


def pages():
    for program in PROGRAMS:
        yield program, (program,)
        for verb in verbs(program):
            yield f"{program}-{verb}", (program, verb)


def manual(name, section=1):
    """As text: without the marks of fonts, and every hyphen the same."""
    text = (BUILD / f"Manuals/man/man{section}/{name}.{section}").read_text()
    return re.sub(r"\\f.|\\&", "", text).replace("\\-", "-")


class Manuals(unittest.TestCase):
    def test_each_option_of_the_help_has_a_line(self):
        for name, command in pages():
            shown = options(help_of(*command))
            self.assertIn("--help", shown)
            lines = manual(name).splitlines()
            for option in shown:
                self.assertTrue(any(re.match(rf"(-\w, )?{re.escape(option)}( |,|$)", line) for line in lines),
                                f"{name}(1) lacks {option}")

    def test_each_verb_is_named_by_its_program(self):
        self.assertIn("decode", verbs("kelvasictl"))
        for verb in verbs("kelvasictl"):
            self.assertIn(f"kelvasictl-{verb}(1)", manual("kelvasictl"))

    def test_what_is_not_in_the_help_is_not_in_the_manual_either(self):
        for name, _ in pages():
            self.assertNotIn("--describe", manual(name))

    def test_the_options_of_examples_are_there(self):
        seen = 0
        for path in sorted((SOURCES / "Docs/Manuals").glob("*.md")):
            for line in re.findall(r"^    (.*)", path.read_text(), re.MULTILINE):
                for program, verb, rest in re.findall(r"\b(kelvasictl|telvon-sim)(?: (\w+))?([^|>]*)", line):
                    known = options(help_of(program, *([verb] if verb else [])))
                    for option in re.findall(r"(?<!\S)--?[a-z][a-z-]*", rest):
                        self.assertIn(option, known, f"{path.name}: {line}")
                        seen += 1
        self.assertGreater(seen, 10)

    def test_help_of_a_verb_is_the_verb_s_help(self):
        for verb in verbs("kelvasictl"):
            self.assertEqual(run(PROGRAMS["kelvasictl"], "help", verb).stdout, help_of("kelvasictl", verb))
        self.assertEqual(run(PROGRAMS["kelvasictl"], "help").stdout, help_of("kelvasictl"))

    def test_help_of_what_is_no_verb_is_wrong_usage(self):
        result = run(PROGRAMS["kelvasictl"], "help", "dance")
        self.assertEqual((result.returncode, result.stdout), (2, ""))
        self.assertIn("dance", result.stderr)

    @needs("man")
    def test_they_read_without_complaint(self):
        paths = sorted((BUILD / "Manuals/man").rglob("*.[157]"))
        self.assertGreater(len(paths), 10)
        for path in paths:
            said = run("man", "--warnings", "-l", "-Tutf8", path, env=os.environ | {"MANWIDTH": "120", "LC_ALL": "C.UTF-8"})
            self.assertEqual((said.returncode, said.stderr), (0, ""), path)
            self.assertRegex(said.stdout, "NAME|N\bNA\bA")


if __name__ == "__main__":
    unittest.main()
