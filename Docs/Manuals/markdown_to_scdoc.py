# SPDX-License-Identifier: Apache-2.0
"""Turns the Markdown of the documents into what scdoc makes manuals of.

Headings, paragraphs, lists, tables, code and pictures as the documents have them; what a manual cannot show (pictures, HTML)
is left out.
"""

import re

INLINE = re.compile(r"`([^`]+)`|\*\*([^*]+)\*\*|\*([^*]+)\*|\[([^\]]*)\]\([^)]*\)")
WIDTH, GAP = 72, 3  # of a terminal's line, less the margin; between columns
ITEM = re.compile(r"( *)(?:[-*]|(\d+)\.) +(.*)")


def escaped(text):
    return re.sub(r"([\\_*`#~\[\]+|<>-])", r"\\\1", text)


def inline(text):
    """Code is bold in manuals; of a link its text stays."""
    result, end = "", 0
    for match in INLINE.finditer(text):
        code, strong, emphasis, link = match.groups()
        result += escaped(text[end:match.start()])
        if emphasis is not None:
            result += f"_{escaped(emphasis)}_"
        elif link is not None:
            result += inline(link)
        else:
            result += f"*{escaped(code or strong)}*"
        end = match.end()
    return result + escaped(text[end:])


def heading(line):
    depth = len(line) - len(line.lstrip("#"))
    title = line.lstrip("# ").replace("`", "")
    return ["", f"# {title.upper()}" if depth <= 2 else f"## {title}", ""]


def literal(lines):
    return ["", "```", *(line.replace("\\", "\\\\") for line in lines), "```", ""]


def cells(row):
    return [cell.strip().replace("\\|", "|") for cell in re.split(r"(?<!\\)\|", row.strip().strip("|"))]


def fits(rows):
    """Whether a terminal has room for the columns without words being cut in two."""
    longest = [max(len(word) for cell in column for word in [*cell.split(), ""]) for column in zip(*rows)]
    return sum(longest) + GAP * len(longest) <= WIDTH


def table(rows):
    head, _, *body = [cells(row) for row in rows]  # the second is the line between
    rows = [[cell and f"*{cell}*" for cell in head], *body] if any(head) else body
    if not fits(rows):
        return entries(head, body)
    result = [""]
    for place, row in enumerate(rows):
        for column, cell in enumerate(row):
            start = "|" if column == 0 else ":"
            align = ("<" if column == len(row) - 1 else "[") if place == 0 else " "
            result.append(f"{start}{align}" + (f" {inline(cell)}" if cell else ""))
    return [*result, ""]


def entries(head, body):
    """A table that is too wide: its rows one below the other."""
    result = [""]
    for first, *rest in body:
        told = [f"_{escaped(name)}_: {inline(cell)}" if name and len(rest) > 1 else inline(cell)
                for name, cell in zip(head[1:], rest) if cell]
        result += [inline(first), "\t" + "; ".join(told), ""]
    return result


def item(lines):
    """A list's item, whose first line is lines[0], with the lines that go on with it."""
    indent, number, text = ITEM.match(lines[0]).groups()
    tabs = "\t" * (len(indent) // 2)
    text = " ".join([text, *(line.strip() for line in lines[1:])])
    return [f"{tabs}{'.' if number else '-'} {inline(text)}"]


class Blocks:
    """The blocks of a document, one after the other."""

    def __init__(self, lines):
        self.lines = lines

    def take_while(self, condition):
        taken = []
        while self.lines and condition(self.lines[0]):
            taken.append(self.lines.pop(0))
        return taken

    def fenced(self):
        self.lines.pop(0)
        code = self.take_while(lambda line: not line.startswith("```"))
        self.lines.pop(0)
        return literal(code)

    def code(self):
        code = self.take_while(lambda line: line.startswith("    ") or not line.strip())
        while not code[-1].strip():
            code.pop()
        return literal([line[4:] for line in code])

    def items(self):
        result = [""]
        while self.lines and ITEM.match(self.lines[0]):
            first = [self.lines.pop(0)]
            result += item(first + self.take_while(lambda line: line.startswith("  ") and not ITEM.match(line)))
            if len(self.lines) > 1 and not self.lines[0] and ITEM.match(self.lines[1]):
                self.lines.pop(0)
        return [*result, ""]

    def next(self):
        line = self.lines[0]
        if not line.strip() or line.startswith(("<", "!")):
            self.lines.pop(0)
            return [""]
        if line.startswith("#"):
            return heading(self.lines.pop(0))
        if line.startswith("```"):
            return self.fenced()
        if line.startswith("    "):
            return self.code()
        if line.startswith("|"):
            return table(self.take_while(lambda each: each.startswith("|")))
        if ITEM.match(line):
            return self.items()
        paragraph = self.take_while(lambda each: each.strip() and not each.startswith(("|", "#", "```"))
                                    and not ITEM.match(each))
        return ["", inline(" ".join(each.strip() for each in paragraph)), ""]


def convert(text):
    """The lines of scdoc, never two empty ones in a row."""
    blocks = Blocks(text.splitlines())
    result = []
    while blocks.lines:
        result += blocks.next()
    return [line for place, line in enumerate(result) if line or (place and result[place - 1])]
