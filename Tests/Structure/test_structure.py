# SPDX-License-Identifier: Apache-2.0
"""check_layers.py on small trees: each include that it refuses, and those that it must not."""

import pathlib
import sys
import tempfile
import unittest

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[1]))
import check_layers  # noqa: E402


class Structure(unittest.TestCase):
    def faults(self, check, file, include):
        with tempfile.TemporaryDirectory() as folder:
            path = pathlib.Path(folder) / file
            path.parent.mkdir(parents=True)
            path.write_text(f"#include {include}\n")
            before, check_layers.ROOT = check_layers.ROOT, pathlib.Path(folder)
            try:
                return list(check(pathlib.Path(file)))
            finally:
                check_layers.ROOT = before

    def check(self, check, refused, allowed):
        for file, include in refused:
            with self.subTest(file=file, refused=include):
                self.assertEqual(len(self.faults(check, file, include)), 1)
        for file, include in allowed:
            with self.subTest(file=file, allowed=include):
                self.assertEqual(self.faults(check, file, include), [])

    def test_a_folder_includes_only_what_stands_below_it(self):
        self.check(check_layers.faults_of_direction,
                   [("Model/A.h", '"App/B.h"'), ("Radio/A.h", "<syslog.h>")],
                   [("App/A.h", '"Model/B.h"'), ("Radio/A.h", "<vector>"), ("Platform/Posix/A.h", "<syslog.h>")])

    def test_a_room_includes_only_what_stands_below_it(self):
        self.check(check_layers.faults_of_room,
                   [("Simulator/Radio/A.h", '"Simulator/Handset/B.h"'), ("Simulator/Radio/A.h", '"Simulator/GSM/B.h"'),
                    ("Simulator/Handset/A.h", '"Simulator/Daemon/B.h"'), ("Simulator/Handset/A.h", '"Simulator/LTE/B.h"'),
                    ("Simulator/Daemon/A.h", '"Simulator/UTRAN/B.h"'), ("LogGenerator/Daemon/A.h", '"LogGenerator/C2K/B.h"'),
                    ("Platform/Posix/A.h", '"Platform/Qt/B.h"'), ("Survey/Cells/A.h", '"Survey/Events/B.h"'),
                    ("Tools/Kelvasi/A.h", '"Tools/Kelvasictl/B.h"')],
                   [("Simulator/GSM/A.h", '"Simulator/Daemon/B.h"'), ("Simulator/Daemon/A.h", '"Simulator/Handset/B.h"'),
                    ("Simulator/Handset/A.h", '"Simulator/Radio/B.h"'), ("Simulator/GSM/A.h", '"Simulator/Scenario.h"'),
                    ("Simulator/GSM/A.h", '"Simulator/GSM/B.h"'), ("Simulator/ScenarioList.cpp", '"Simulator/GSM/B.h"'),
                    ("LogGenerator/LTE/A.h", '"LogGenerator/Daemon/B.h"'), ("Simulator/LTE/A.h", '"LogGenerator/LTE/B.h"')])

    def test_a_technology_includes_no_other(self):
        self.check(check_layers.faults_of_technology,
                   [("LogGenerator/LTE/A.h", '"LogGenerator/GSM/B.h"'), ("Tests/Simulator/GSM/A.h", '"Simulator/UTRAN/B.h"')],
                   [("Simulator/LTE/A.h", '"LogGenerator/LTE/B.h"')])

    def test_few_include_what_is_costly(self):
        self.check(check_layers.faults_of_cost,
                   [("Tools/Kelvasictl/A.cpp", "<CLI/CLI.hpp>"), ("Tests/Tools/A.cpp", "<CLI/CLI.hpp>")],
                   [("Tools/OptionSet.cpp", "<CLI/CLI.hpp>"), ("Tools/Kelvasictl/A.cpp", "<vector>")])


if __name__ == "__main__":
    unittest.main()
