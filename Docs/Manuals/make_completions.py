#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Makes the completions of a program for bash, zsh and fish from what it tells with --describe."""

import argparse
import json
import pathlib
import re
import shlex
import shutil

FILES = {"FILE", "CAPTURE", "COMMAND"}
FOLDERS = {"DIR"}
HEAD = "# SPDX-License-Identifier: Apache-2.0\n# Made by make_completions.py.\n"


class Value:
    """What may stand after an option."""

    def __init__(self, option, words):
        kind, _, rest = option["type"].partition(":")
        listed = re.search(r"\{([^}]*)\}", rest)
        self.name = option["positional"] or kind
        self.words = listed[1].split(",") if listed else words.get(kind, [])
        self.is_file = not self.words and (kind in FILES or option["positional"] in FILES)
        self.is_folder = kind in FOLDERS


def named(table):
    return [option for option in table["options"] if option["names"]]


def positional(table):
    return [option for option in table["options"] if option["positional"]]


def commands(table):
    """The program under the empty name, and each verb under its own."""
    return [("", table), *((verb["name"], verb) for verb in table["verbs"])]


# bash

BASH = """\
{function}() {{
  local current=${{COMP_WORDS[COMP_CWORD]}} previous=${{COMP_WORDS[COMP_CWORD - 1]}} verb= word
  [ "$current" = = ] && current=
  [ "$previous" = = ] && previous=${{COMP_WORDS[COMP_CWORD - 2]}}
  for word in "${{COMP_WORDS[@]:1:COMP_CWORD-1}}"; do
    case " {verbs} " in *" $word "*) verb=$word; break ;; esac
  done
  COMPREPLY=()
  case "$verb $previous" in
{values}
  esac
  case "$verb $current" in
{options}
  esac
  return 0
}}
complete -o default -F {function} {program}
"""


def bash_reply(words):
    lines = f'COMPREPLY=($(compgen -W "{" ".join(words)}" -- "$current"))'
    if any(word.endswith("=") for word in words):
        lines += '; [ "${COMPREPLY[0]: -1}" != = ] || compopt -o nospace'
    return lines


def bash(table):
    values, options = [], []
    for verb, command in commands(table):
        for option in named(command):
            value = Value(option, table["words"])
            place = "|".join(f'"{verb} {name}"' for name in option["names"])
            if value.words:
                values.append(f"    {place}) {bash_reply(value.words)}; return ;;")
            elif value.is_folder:
                values.append(f'    {place}) COMPREPLY=($(compgen -d -- "$current")); return ;;')
        names = [name for option in named(command) for name in option["names"]]
        options.append(f'    "{verb} -"*) {bash_reply(names)} ;;')
        words = [word for option in positional(command) for word in Value(option, table["words"]).words]
        words += [each["name"] for each in command["verbs"]]
        if words:
            options.append(f'    "{verb} "*) {bash_reply(words)} ;;')
    verbs = " ".join(verb["name"] for verb in table["verbs"])
    function = "_" + table["name"].replace("-", "_")
    return HEAD + BASH.format(function=function, verbs=verbs, values="\n".join(values), options="\n".join(options),
                              program=table["name"])


# zsh

def zsh_text(text):
    return re.sub(r"([\[\]:\\])", r"\\\1", text)


def zsh_action(value):
    if value.words:
        return "(" + " ".join(zsh_text(word) for word in value.words) + ")"
    return "_files -/" if value.is_folder else "_files" if value.is_file else ""


def zsh_specs(command, words):
    for option in named(command):
        value = Value(option, words)
        for name in option["names"]:
            end = "" if option["flag"] else f":{value.name}:{zsh_action(value)}"
            many = "*" if option["many"] else ""
            equal = "=" if not option["flag"] and name.startswith("--") else ""
            yield f"{many}{name}{equal}[{zsh_text(option['description'])}]{end}"
    for option in positional(command):
        value = Value(option, words)
        yield f"{'*' if option['many'] else '1'}:{value.name}:{zsh_action(value)}"


def zsh_arguments(command, words, indent):
    return " \\\n".join([f"{indent}_arguments"] + [f"{indent}  {shlex.quote(spec)}" for spec in zsh_specs(command, words)])


def zsh(table):
    program, words = table["name"], table["words"]
    head = f"#compdef {program}\n" + HEAD
    if not table["verbs"]:
        return head + zsh_arguments(table, words, "") + "\n"
    lines = [head + "local -a verbs", "local state line", "verbs=("]
    lines += [f"  {shlex.quote(verb['name'] + ':' + zsh_text(verb['description']))}" for verb in table["verbs"]]
    lines += [")", zsh_arguments(table, words, "") + " \\", "  '1:verb:->verb' '*::argument:->rest'", 'case "$state" in',
              "  verb) _describe verb verbs ;;", "  rest)", '    case "$words[1]" in']
    for verb in table["verbs"]:
        lines += [f"      {verb['name']})", zsh_arguments(verb, words, "        "), "        ;;"]
    return "\n".join([*lines, "    esac", "    ;;", "esac", ""])


# fish

def fish_quote(text):
    return "'" + text.replace("\\", "\\\\").replace("'", "\\'") + "'"


def fish_value(value):
    if value.words:
        return f" -x -a {fish_quote(' '.join(value.words))}"
    if value.is_folder:
        return " -x -a '(__fish_complete_directories)'"
    return " -r -F" if value.is_file else " -x"


def fish(table):
    program = table["name"]
    lines = [HEAD.rstrip()]
    for verb, command in commands(table):
        where = f" -n '__fish_seen_subcommand_from {verb}'" if verb else " -n __fish_use_subcommand" if table["verbs"] else ""
        start = f"complete -c {program}{where}"
        takes_files = any(Value(option, table["words"]).is_file for option in positional(command))
        lines.append(f"{start} {'-F' if takes_files else '-f'}")
        for option in named(command):
            names = "".join(f" -l {name[2:]}" if name.startswith("--") else f" -s {name[1:]}" for name in option["names"])
            value = "" if option["flag"] else fish_value(Value(option, table["words"]))
            lines.append(f"{start}{names} -d {fish_quote(option['description'])}{value}")
        for option in positional(command):
            words = Value(option, table["words"]).words
            if words:
                lines.append(f"{start} -a {fish_quote(' '.join(words))}")
        for each in command["verbs"]:
            lines.append(f"{start} -a {each['name']} -d {fish_quote(each['description'])}")
    return "\n".join(lines) + "\n"


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--output", type=pathlib.Path, required=True, help="bash, zsh and fish come to lie there")
    parser.add_argument("tables", nargs="+", type=pathlib.Path, help="what each program tells with --describe")
    given = parser.parse_args()
    shutil.rmtree(given.output, ignore_errors=True)
    for path in given.tables:
        table = json.loads(path.read_text())
        name = table["name"]
        for shell, file, text in (("bash", name, bash(table)), ("zsh", f"_{name}", zsh(table)),
                                  ("fish", f"{name}.fish", fish(table))):
            folder = given.output / shell
            folder.mkdir(parents=True, exist_ok=True)
            (folder / file).write_text(text)


if __name__ == "__main__":
    main()
