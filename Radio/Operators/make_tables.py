#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Writes the tables of operators and countries as C++.

Operators by MCC and MNC come from mobile-broadband-provider-info, networks.csv over them; the countries of a mobile
country code from countries.csv, their names from iso-codes.
"""

import argparse
import collections
import csv
import json
import xml.etree.ElementTree as xml

LANGUAGE = "{http://www.w3.org/XML/1998/namespace}lang"

HEAD = """// Written by make_tables.py.
#include "Radio/OperatorTables.h"

#include <array>

namespace kelvasi {

namespace {

"""
TAIL = """}  // namespace

std::span<const NetworkEntry> networkTable() {
  return networks;
}

std::span<const CountryEntry> countryTable() {
  return countries;
}

}  // namespace kelvasi
"""


def rows_of(path):
    with open(path, encoding="utf-8", newline="") as file:
        return list(csv.reader(line for line in file if not line.startswith("#")))


def name_of(provider):
    """The one that is not a translation."""
    names = provider.findall("name")
    plain = [name for name in names if name.get(LANGUAGE) is None] or names
    return " ".join(plain[0].text.split())


def providers_by_network(path):
    """(MCC, MNC) to providers, in the order of the file."""
    found = collections.defaultdict(list)
    for country in xml.parse(path).getroot().findall("country"):
        for provider in country.findall("provider"):
            for network in provider.iter("network-id"):
                found[network.get("mcc"), network.get("mnc")].append(provider)
    return found


def name_of_all(providers):
    """The primary one's where there is one such; else all of them: which is the operator is not said."""
    names = list(dict.fromkeys(map(name_of, providers)))
    primary = {name_of(provider) for provider in providers if provider.get("primary") == "true"}
    return primary.pop() if len(primary) == 1 else " / ".join(names)


def networks(providers, own):
    found = {network: name_of_all(listed) for network, listed in providers_by_network(providers).items()}
    found |= {(mcc, mnc): name for mcc, mnc, name in rows_of(own)}
    return sorted((int(mcc), int(mnc), len(mnc), name) for (mcc, mnc), name in found.items())


def in_order(name):
    """As one says it: "Virgin Islands, U.S." is listed by its most telling word."""
    first, comma, rest = name.partition(", ")
    return f"{rest} {first}" if comma and (rest.split()[-1] in ("of", "the", "U.S.", "British")) else name


def country_names(iso):
    with open(iso, encoding="utf-8") as file:
        countries = json.load(file)["3166-1"]
    return {entry["alpha_2"]: entry.get("common_name") or in_order(entry["name"]) for entry in countries}


def countries(listed, iso):
    names = country_names(iso)
    return sorted((int(mcc), " / ".join(names[code] for code in codes.split()) if codes else own)
                  for mcc, codes, own in rows_of(listed))


def literal(text):
    return '"' + text.replace("\\", "\\\\").replace('"', '\\"') + '"'


def table(name, kind, rows):
    lines = ",\n".join(f"    {kind}{{{', '.join(row)}}}" for row in rows)
    return f"constexpr std::array<{kind}, {len(rows)}> {name}{{{{\n{lines},\n}}}};\n\n"


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    for option in ("providers", "iso-3166-1", "networks", "countries", "output"):
        parser.add_argument(f"--{option}", required=True)
    options = parser.parse_args()
    network_rows = [(f"{{{mcc}, {mnc}, {digits}}}", literal(name))
                    for mcc, mnc, digits, name in networks(options.providers, options.networks)]
    country_rows = [(str(mcc), literal(name)) for mcc, name in countries(options.countries, options.iso_3166_1)]
    with open(options.output, "w", encoding="utf-8") as file:
        file.write(HEAD + table("networks", "NetworkEntry", network_rows) +
                   table("countries", "CountryEntry", country_rows) + TAIL)


if __name__ == "__main__":
    main()
