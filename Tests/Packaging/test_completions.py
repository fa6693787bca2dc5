# SPDX-License-Identifier: Apache-2.0
"""What the shells offer after a Tab, asked of the shells themselves."""

import os
import pty
import re
import select
import time
import unittest

from packaging_support import BUILD, PATIENCE, needs, run

MADE = BUILD / "Manuals/completions"

# What is typed, what is offered among others, what is not.
CASES = [
    ("kelvasictl re", {"readings", "record"}, {"decode"}),
    ("kelvasictl decode --fo", {"--format"}, {"--seconds"}),
    ("kelvasictl decode --technology Orvane_L", {"Orvane_LTE"}, {"IFX"}),
    ("kelvasictl decode --format t", {"tree"}, {"json"}),
    ("kelvasictl readings --select rs", {"rsrp", "rsrq"}, {"earfcn"}),
    ("kelvasictl alarms --rule rs", {"rsrp", "rscp"}, {"earfcn"}),
    ("kelvasictl help de", {"decode"}, {"record"}),
    ("telvon-sim --technology Orvane_U", {"Orvane_UTRAN2"}, {"IFX"}),
    ("telvon-sim --scenario d", {"drive"}, {"mobility"}),
    ("telvon-sim --fault dea", {"dead-port", "death="}, {"stall="}),
    ("kelvasi --appearance d", {"dark"}, {"light"}),
]

BASH = """
source "$1"
compopt() { :; }
COMP_WORDS=($2)
COMP_CWORD=$((${#COMP_WORDS[@]} - 1))
function=$(complete -p "${COMP_WORDS[0]}" | sed 's/.*-F \\([^ ]*\\).*/\\1/')
"$function"
printf '%s\\n' "${COMPREPLY[@]}"
"""


class Completions(unittest.TestCase):
    def check(self, offers):
        for typed, some, none in CASES:
            with self.subTest(typed=typed):
                offered = offers(typed)
                self.assertLessEqual(some, offered)
                self.assertEqual(none & offered, set())

    @needs("bash")
    def test_bash(self):
        def offers(typed):
            result = run("bash", "--norc", "-c", BASH, "-", MADE / "bash" / typed.split()[0], typed)
            self.assertEqual((result.returncode, result.stderr), (0, ""))
            return set(result.stdout.split())
        self.check(offers)

    @needs("fish")
    def test_fish(self):
        def offers(typed):
            result = run("fish", "-c", f"source {MADE}/fish/{typed.split()[0]}.fish; complete -C '{typed}'",
                         env=os.environ | {"HOME": "/nonexistent"})
            self.assertEqual((result.returncode, result.stderr), (0, ""))
            return {line.split("\t")[0] for line in result.stdout.splitlines()}
        self.check(offers)

    @needs("zsh")
    def test_zsh(self):
        shell = Zsh()
        self.addCleanup(shell.end)
        self.check(shell.offers)


class Zsh:
    """zsh completes only for somebody who types: here that is a terminal of the test's own."""

    def __init__(self):
        self.process, self.terminal = pty.fork()
        if not self.process:
            os.environ |= {"TERM": "dumb", "PS1": "", "LC_ALL": "C", "COLUMNS": "1000"}
            os.execvp("zsh", ["zsh", "-f", "-i"])
        self.say(f"fpath=({MADE}/zsh $fpath); autoload -U compinit; compinit -u -D; LISTMAX=10000")
        self.say("stty -echo cols 1000; unsetopt prompt_sp; setopt no_list_beep; PS1=rea''dy; echo en''d")
        self.heard()

    def say(self, line):
        os.write(self.terminal, line.encode() + b"\n")

    def heard(self):
        """Everything up to the mark and the prompt after it: typed before it, keys would be the terminal's, not zsh's."""
        text, end = "", time.monotonic() + PATIENCE
        while not re.search(r"\nend\r?\n.*ready", text, re.DOTALL):
            if not select.select([self.terminal], [], [], max(0, end - time.monotonic()))[0]:
                raise AssertionError(f"zsh said only {text!r}")
            text += os.read(self.terminal, 65536).decode(errors="replace")
        return text

    # Ctrl+D lists what fits without choosing; where one word fits Tab writes it. Ctrl+U clears the line.
    def offers(self, typed):
        os.write(self.terminal, typed.encode() + b"\x04")
        os.write(self.terminal, b"\x15echo en''d\n")
        return set(self.heard().replace("\r", "").split())

    def end(self):
        os.close(self.terminal)
        os.waitpid(self.process, 0)


if __name__ == "__main__":
    unittest.main()
