# SPDX-License-Identifier: Apache-2.0
"""The tables of operators and countries against the packages that they come from, and what the build makes of others."""

import json
import os
import pathlib
import subprocess
import sys
import tempfile
import unittest

sys.path.insert(0, os.environ["OPERATORS"])
import make_tables

OPERATORS = pathlib.Path(os.environ["OPERATORS"])
PROVIDERS = os.environ["PROVIDERS"]
ISO = os.environ["ISO_3166_1"]

# Jersey, Guernsey and Man share the code of the United Kingdom; three networks of Russia are listed for Uganda.
ELSEWHERE = {("234", "gg"), ("234", "im"), ("234", "je"), ("250", "ug"), ("221", "xk")}


class Tables(unittest.TestCase):
    def test_countries_agree_with_those_of_the_providers(self):
        codes = {mcc: codes.lower().split() for mcc, codes, _ in make_tables.rows_of(OPERATORS / "countries.csv")}
        for country in make_tables.xml.parse(PROVIDERS).getroot().findall("country"):
            for network in country.iter("network-id"):
                pair = (network.get("mcc"), country.get("code"))
                if pair not in ELSEWHERE:
                    self.assertIn(pair[1], codes[pair[0]], pair)

    def test_a_country_has_codes_or_a_name_of_our_own_and_all_codes_have_names(self):
        rows = make_tables.rows_of(OPERATORS / "countries.csv")
        names = make_tables.country_names(ISO)
        for mcc, codes, own in rows:
            self.assertRegex(mcc, r"\A\d{3}\Z")
            self.assertEqual(bool(codes), not own, mcc)
            self.assertTrue(all(names[code] for code in codes.split()), mcc)
        self.assertEqual(len({row[0] for row in rows}), len(rows))

    def test_every_name_of_our_own_is_of_one_network(self):
        rows = make_tables.rows_of(OPERATORS / "networks.csv")
        self.assertEqual(len({tuple(row[:2]) for row in rows}), len(rows))
        for mcc, mnc, name in rows:
            self.assertRegex(mcc + "-" + mnc, r"\A\d{3}-\d{2,3}\Z")
            self.assertTrue(name)


class Made(unittest.TestCase):
    """From packages typed by hand."""

    PROVIDERS = """<serviceproviders format="2.0"><country code="aa">
      <provider primary="true"><name xml:lang="xx">Eins</name><name>One "1"</name>
        <gsm><network-id mcc="001" mnc="02"/><network-id mcc="001" mnc="002"/></gsm></provider>
      <provider><name>Reseller</name><gsm><network-id mcc="001" mnc="02"/></gsm></provider>
      <provider><name>Two</name><gsm><network-id mcc="001" mnc="03"/></gsm></provider>
      <provider><name>Three</name><gsm><network-id mcc="001" mnc="03"/></gsm></provider>
      <provider><name>Four</name><gsm><network-id mcc="001" mnc="04"/></gsm></provider>
    </country></serviceproviders>"""
    COUNTRIES = {"3166-1": [{"alpha_2": "AA", "name": "Isles, Republic of the"},
                            {"alpha_2": "BB", "name": "Long", "common_name": "Short"},
                            {"alpha_2": "CC", "name": "This, That and More"}]}

    def make(self):
        with tempfile.TemporaryDirectory() as directory:
            paths = {name: pathlib.Path(directory, name)
                     for name in ("providers", "iso-3166-1", "networks", "countries", "output")}
            paths["providers"].write_text(self.PROVIDERS)
            paths["iso-3166-1"].write_text(json.dumps(self.COUNTRIES))
            paths["networks"].write_text("# ours\n001,04,Ours\n")
            paths["countries"].write_text("001,AA BB,\n002,CC,\n003,,elsewhere\n")
            options = [piece for name, path in paths.items() for piece in (f"--{name}", path)]
            subprocess.run([sys.executable, OPERATORS / "make_tables.py", *options], check=True)
            return paths["output"].read_text()

    def test_networks(self):
        entries = [line.strip() for line in self.make().splitlines() if line.startswith("    NetworkEntry{")]
        self.assertEqual(entries, [r'NetworkEntry{{1, 2, 2}, "One \"1\""},', r'NetworkEntry{{1, 2, 3}, "One \"1\""},',
                                   'NetworkEntry{{1, 3, 2}, "Two / Three"},', 'NetworkEntry{{1, 4, 2}, "Ours"},'])

    def test_countries(self):
        entries = [line.strip() for line in self.make().splitlines() if line.startswith("    CountryEntry{")]
        self.assertEqual(entries, ['CountryEntry{1, "Republic of the Isles / Short"},',
                                   'CountryEntry{2, "This, That and More"},', 'CountryEntry{3, "elsewhere"},'])


if __name__ == "__main__":
    unittest.main()
