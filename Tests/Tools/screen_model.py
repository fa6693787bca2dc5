# SPDX-License-Identifier: Apache-2.0
"""What a terminal of kind screen-256color shows of the bytes that it is sent (ECMA-48, and DEC's private modes)."""

import codecs
import re
import unicodedata

SEQUENCE = re.compile(r"\x1b\[([?>]?)([0-9;:]*)([@-~])|\x1b\](?:[^\x07\x1b]*)(?:\x07|\x1b\\)|\x1b[()][0-9A-B]|\x1b([=>78MHDE])")
BLANK = (" ", "default", "default", False)  # character, colour, ground, reversed


def width(character):
    if unicodedata.combining(character):
        return 0
    return 2 if unicodedata.east_asian_width(character) in "WF" else 1


class Screen:
    """Raises ValueError at a sequence that it does not know."""

    def __init__(self, columns, rows):
        self.columns, self.rows = columns, rows
        self.decoder = codecs.getincrementaldecoder("utf-8")("replace")
        self.pending = ""
        self.has_cursor = True
        self.saved = (0, 0)
        self.reset()

    def reset(self):
        self.cells = [[BLANK] * self.columns for _ in range(self.rows)]
        self.column = self.row = 0
        self.top, self.bottom = 0, self.rows - 1
        self.pen()

    def pen(self):
        self.colour = self.ground = "default"
        self.is_reversed = False

    def resize(self, columns, rows):
        kept = [line[:columns] + [BLANK] * (columns - len(line)) for line in self.cells[:rows]]
        self.columns, self.rows = columns, rows
        self.cells = kept + [[BLANK] * columns for _ in range(rows - len(kept))]
        self.column, self.row = min(self.column, columns - 1), min(self.row, rows - 1)
        self.top, self.bottom = 0, rows - 1

    def lines(self):
        return ["".join(cell[0] for cell in line).rstrip() for line in self.cells]

    def colours(self):
        return {cell[1] for line in self.cells for cell in line}

    def feed(self, data):
        self.pending += self.decoder.decode(data)
        while self.pending:
            if self.pending[0] == "\x1b":
                match = SEQUENCE.match(self.pending)
                if not match:
                    if len(self.pending) > 100000:
                        raise ValueError(f"an unknown sequence: {self.pending[:20]!r}")
                    return  # the rest is to come
                self.pending = self.pending[match.end():]
                self.obey(match)
            else:
                character, self.pending = self.pending[0], self.pending[1:]
                self.write(character)

    def write(self, character):
        if character == "\r":
            self.column = 0
        elif character == "\n":
            self.line_feed()
        elif character == "\b":
            self.column = max(self.column - 1, 0)
        elif character == "\t":
            self.column = min((self.column // 8 + 1) * 8, self.columns - 1)
        elif character >= " " and character != "\x7f":
            self.put(character)

    def put(self, character):
        size = width(character)
        if size == 0:
            before = self.cells[self.row][self.column - 1]
            self.cells[self.row][self.column - 1] = (before[0] + character, *before[1:])
            return
        if self.column + size > self.columns:
            self.column = 0
            self.line_feed()
        for at in range(size):
            self.cells[self.row][self.column + at] = (character if at == 0 else "", self.colour, self.ground, self.is_reversed)
        self.column += size

    def line_feed(self):
        if self.row == self.bottom:
            self.scroll(self.top, 1)
        else:
            self.row = min(self.row + 1, self.rows - 1)

    def scroll(self, begin, lines):
        """Lines from `begin` to the region's end go up, or down where there are less than none."""
        for _ in range(abs(lines)):
            gone, new = (begin, self.bottom) if lines > 0 else (self.bottom, begin)
            del self.cells[gone]
            self.cells.insert(new, [self.blank()] * self.columns)

    def blank(self):
        return (" ", "default", self.ground, False)

    def obey(self, match):
        private, words, final, other = match.groups()
        if other:
            self.obey_short(other)
        elif final and private:
            if final == "h" or final == "l":
                self.has_cursor = final == "h" if words == "25" else self.has_cursor
        elif final:
            numbers = [int(word) if word else 0 for word in words.replace(":", ";").split(";")]
            self.obey_control(final, numbers, max(numbers[0], 1))

    def obey_short(self, name):
        if name == "M":
            if self.row == self.top:
                self.scroll(self.top, -1)
            else:
                self.row -= 1
        elif name == "7":
            self.saved = (self.column, self.row)
        elif name == "8":
            self.column, self.row = self.saved

    def obey_control(self, final, numbers, count):
        line = self.cells[self.row]
        column = min(self.column, self.columns - 1)
        if final == "m":
            self.render(numbers)
        elif final in "Hf":
            self.row = min(count, self.rows) - 1
            self.column = min(max(numbers[1] if len(numbers) > 1 else 1, 1), self.columns) - 1
        elif final in "ABCDGd":
            self.move(final, count)
        elif final == "J":
            self.erase({0: (self.row, self.rows), 1: (0, self.row), 2: (0, self.rows)}[numbers[0]], numbers[0])
        elif final == "K":
            begin, end = {0: (column, self.columns), 1: (0, column + 1), 2: (0, self.columns)}[numbers[0]]
            line[begin:end] = [self.blank()] * (end - begin)
        elif final == "X":
            end = min(column + count, self.columns)
            line[column:end] = [self.blank()] * (end - column)
        elif final == "P":
            del line[column:column + count]
            line += [self.blank()] * (self.columns - len(line))
        elif final == "@":
            line[column:column] = [self.blank()] * count
            del line[self.columns:]
        elif final in "LM":
            self.scroll(self.row, count if final == "M" else -count)
        elif final in "ST":
            self.scroll(self.top, count if final == "S" else -count)
        elif final == "r":
            self.top, self.bottom = count - 1, (numbers[1] if len(numbers) > 1 and numbers[1] else self.rows) - 1
            self.column = self.row = 0
        elif final not in "hltnc":
            raise ValueError(f"an unknown control: {numbers} {final}")

    def move(self, final, count):
        if final in "CD":
            count = count if final == "C" else -count
            self.column = min(max(self.column + count, 0), self.columns - 1)
        elif final in "AB":
            self.row = min(max(self.row + (count if final == "B" else -count), 0), self.rows - 1)
        elif final == "G":
            self.column = min(count, self.columns) - 1
        else:
            self.row = min(count, self.rows) - 1

    def erase(self, rows, kind):
        if kind == 0:
            self.obey_control("K", [0], 1)
            rows = (self.row + 1, self.rows)
        for row in range(*rows):
            self.cells[row] = [self.blank()] * self.columns

    def render(self, numbers):
        numbers = list(numbers)
        while numbers:
            number = numbers.pop(0)
            if number == 0:
                self.pen()
            elif number in (7, 27):
                self.is_reversed = number == 7
            elif number in (38, 48):
                kind = numbers.pop(0)
                colour = str(numbers.pop(0)) if kind == 5 else "%d;%d;%d" % tuple(numbers.pop(0) for _ in range(3))
                self.colour, self.ground = (colour, self.ground) if number == 38 else (self.colour, colour)
            elif 30 <= number <= 37 or 90 <= number <= 97:
                self.colour = str(number % 30 if number < 40 else number - 82)
            elif 40 <= number <= 47:
                self.ground = str(number - 40)
            elif number == 39:
                self.colour = "default"
            elif number == 49:
                self.ground = "default"
