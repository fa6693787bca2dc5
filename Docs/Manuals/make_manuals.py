#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Makes the manuals of the programs and of the file formats.

The options are those that the programs tell with --describe, the prose is this folder's (NAME.md) and that of the
documents. A verb that a program has needs nothing here; kelvasictl-VERB.md says more than its help does.
"""

import argparse
import json
import pathlib
import re
import shutil
import subprocess

from markdown_to_scdoc import convert, escaped, inline

HERE = pathlib.Path(__file__).resolve().parent
DOCUMENTS = HERE.parent

# Manual, section, document, what it is.
FORMATS = [
    ("kelvasi-capture", 5, "captures.md", "captures and snapshots of a modem's diagnostic stream"),
    ("kelvasi-preferences", 5, "preferences.md", "what the viewer shares with the home screen"),
    ("kelvasi-readings", 5, "readings.md", "what every message of a capture wrote or removed, a line each"),
    ("kelvasi-script", 5, "viewer-script.md", "leading the viewer by a script"),
    ("telvon-log-channel", 7, "log-channel.md", "the bytes between a telephony daemon and its viewers"),
]
SEE_ALSO = {
    "kelvasi": ["kelvasictl(1)", "telvon-sim(1)", "kelvasi-preferences(5)", "kelvasi-script(5)"],
    "kelvasictl": ["kelvasi(1)", "telvon-sim(1)", "kelvasi-capture(5)", "kelvasi-readings(5)"],
    "telvon-sim": ["kelvasi(1)", "kelvasictl(1)", "kelvasi-capture(5)", "telvon-log-channel(7)"],
}


def by_manual(text):
    """Documents that are manuals too are named as these."""
    for name, section, document, _ in FORMATS:
        for written in (f"[Docs/{document}](Docs/{document})", f"Docs/{document}"):
            text = text.replace(written, f"{name}({section})")
    return text


def value_name(option):
    """"FORMAT" of "FORMAT:{json,tree}"."""
    return option["type"].split(":")[0]


def choices(option):
    found = re.search(r":\{([^}]*)\}", option["type"])
    return found[1].split(",") if found else []


def written(option):
    """An option as it is typed, of scdoc."""
    if option["positional"]:
        return f"_{escaped(option['positional'])}_{'...' if option['many'] else ''}"
    names = ", ".join(f"*{escaped(name)}*" for name in option["names"])
    return names if option["flag"] else f"{names} _{escaped(value_name(option))}_"


def explained(option):
    text = by_manual(option["description"])
    allowed = choices(option)
    missing = [choice for choice in allowed if not re.search(rf"\b{re.escape(choice)}\b", text)]
    if missing:
        text += f" (one of {', '.join(allowed)})"
    if option["many"] and not option["positional"] and "again" not in text:
        text += "; may be given again"
    return text if text.endswith((".", "?")) else text + "."


def synopsis(command, table):
    words = [f"*{escaped(word)}*" for word in command.split()]
    required = [option for option in table["options"] if option["required"]]
    words += [written(option) for option in required if not option["positional"]]
    words.append("[OPTION]...".replace("[", "\\[").replace("]", "\\]"))
    if table["verbs"]:
        words.append("_VERB_")
    for option in (each for each in table["options"] if each["positional"]):
        words.append(written(option) if option["required"] else f"\\[{written(option)}\\]")
    return " ".join(words)


def options(table):
    lines = ["# OPTIONS", ""]
    for option in sorted(table["options"], key=lambda each: not each["positional"]):
        lines += [written(option), f"\t{inline(explained(option))}", ""]
    return lines


def footer(table):
    """Plain text: what is indented in it is set as it stands."""
    lines = []
    for line in table["footer"].strip("\n").splitlines():
        indented = line.startswith(" ")
        if lines and indented != lines[-1].startswith(" "):
            lines.append("")
        lines.append(f"    {line.strip()}" if indented else line)
    return ["# MORE", "", *convert(by_manual("\n".join(lines))), ""] if lines else []


def prose(name):
    path = HERE / f"{name}.md"
    return [*convert(by_manual(path.read_text())), ""] if path.exists() else []


def verbs(program, table):
    if not table["verbs"]:
        return []
    lines = ["# VERBS", ""]
    for verb in table["verbs"]:
        lines += [f"*{escaped(verb['name'])}*", f"\t{inline(explained({**verb, 'type': '', 'many': False}))} "
                  f"See *{escaped(program)}-{escaped(verb['name'])}*(1).", ""]
    return lines


def environment():
    """The table of variables that README.md has."""
    rows = re.search(r"^\| variable \| meaning \|\n(?:\|.*\n)+", (DOCUMENTS.parent / "README.md").read_text(), re.MULTILINE)
    return ["# ENVIRONMENT", "", *convert(by_manual(rows[0])), ""]


def see_also(names):
    return ["# SEE ALSO", "", ", ".join(f"*{escaped(name[:-3])}*{name[-3:]}" for name in names), ""]


def page(name, section, version, summary, *parts):
    head = [f'{name}({section}) "Kelvasi {version}" "Kelvasi"', "", "# NAME", "",
            f"{escaped(name)} \\- {inline(summary)}".replace("\\\\-", "-"), ""]
    return "\n".join(line for part in (head, *parts) for line in part)


def lower(text):
    return text[:1].lower() + text[1:].rstrip(".")


def program_pages(table, version):
    name = table["name"]
    yield name, 1, page(name, 1, version, lower(table["description"]), ["# SYNOPSIS", "", synopsis(name, table), ""],
                        prose(name), verbs(name, table), options(table), footer(table), environment(),
                        see_also(SEE_ALSO[name]))
    for verb in table["verbs"]:
        full = f"{name}-{verb['name']}"
        yield full, 1, page(full, 1, version, verb["description"],
                            ["# SYNOPSIS", "", synopsis(f"{name} {verb['name']}", verb), ""], prose(full),
                            options(verb), footer(verb), environment(), see_also([f"{name}(1)", *SEE_ALSO[name]]))


def format_pages(version):
    for name, section, document, summary in FORMATS:
        text = by_manual((DOCUMENTS / document).read_text().split("\n", 1)[1])  # its title is the manual's summary
        yield name, section, page(name, section, version, summary, ["# DESCRIPTION", ""], convert(text), [""],
                                  see_also(["kelvasi(1)", "kelvasictl(1)", "telvon-sim(1)"]))


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--release", required=True, help="the programs' version")
    parser.add_argument("--scdoc", default="scdoc")
    parser.add_argument("--output", type=pathlib.Path, required=True, help="man1, man5 and man7 come to lie there")
    parser.add_argument("tables", nargs="+", type=pathlib.Path, help="what each program tells with --describe")
    given = parser.parse_args()
    shutil.rmtree(given.output, ignore_errors=True)
    pages = [*format_pages(given.release)]
    for table in given.tables:
        pages += program_pages(json.loads(table.read_text()), given.release)
    for name, section, text in pages:
        folder = given.output / f"man{section}"
        folder.mkdir(parents=True, exist_ok=True)
        made = subprocess.run([given.scdoc], input=text, capture_output=True, text=True, check=False)
        if made.returncode:
            raise SystemExit(f"{name}({section}): {made.stderr.strip()}")
        (folder / f"{name}.{section}").write_text(made.stdout)


if __name__ == "__main__":
    main()
