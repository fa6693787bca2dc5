// SPDX-License-Identifier: Apache-2.0
#include "Platform/Terminal/Glyph.h"

#include <wchar.h>

#include <algorithm>
#include <span>

#include "Platform/Plist/Utf8.h"

namespace kelvasi::terminal {

namespace {

struct Range {
  char32_t first, last;
};

// Format characters (general category Cf), separators of lines, and for private use: nobody knows their look.
constexpr std::array unseen{
    Range{0xAD, 0xAD},       Range{0x600, 0x605},     Range{0x61C, 0x61C},     Range{0x6DD, 0x6DD},
    Range{0x70F, 0x70F},     Range{0x890, 0x891},     Range{0x8E2, 0x8E2},     Range{0x180B, 0x180F},
    Range{0x200B, 0x200F},   Range{0x2028, 0x202E},   Range{0x2060, 0x206F},   Range{0xE000, 0xF8FF},
    Range{0xFE00, 0xFE0F},   Range{0xFEFF, 0xFEFF},   Range{0xFFF0, 0xFFFB},   Range{0x110BD, 0x110CD},
    Range{0x13430, 0x13440}, Range{0x1BCA0, 0x1BCA3}, Range{0x1D173, 0x1D17A}, Range{0xE0000, 0x10FFFF},
};

struct Substitute {
  char32_t sign;
  char ascii;
};

// What we write ourselves.
constexpr std::array substitutes{
    Substitute{U'\u2212', '-'}, Substitute{U'\u2013', '-'}, Substitute{U'\u2026', '~'},
    Substitute{U'\u00B7', '.'}, Substitute{U'\u00A0', ' '}, Substitute{U'\u203A', '>'},
    Substitute{U'\u2190', '<'}, Substitute{U'\u2192', '>'}, Substitute{U'\u2191', '^'},
    Substitute{U'\u2193', 'v'}, Substitute{U'\u2197', '/'}, Substitute{U'\u2198', '\\'},
    Substitute{U'\u2500', '-'}, Substitute{U'\u2502', '|'}, Substitute{U'\u25CF', '*'},
    Substitute{U'\u25D0', '+'}, Substitute{U'\u25CB', 'o'}, Substitute{U'\u25A0', '#'},
    Substitute{U'\u25A1', '='}, Substitute{U'\u25B2', '^'}, Substitute{U'\u25BC', 'v'},
    Substitute{U'\u25C6', '*'}, Substitute{U'\u2591', ':'}, Substitute{U'\u250A', ':'},
    Substitute{U'\u2581', '_'}, Substitute{U'\u2582', '.'}, Substitute{U'\u2583', ','},
    Substitute{U'\u2584', '-'}, Substitute{U'\u2585', '~'}, Substitute{U'\u2586', '='},
    Substitute{U'\u2587', '+'}, Substitute{U'\u2588', '#'},
};

bool isUnseen(char32_t code) {
  return std::ranges::any_of(unseen,
                             [code](Range range) { return code >= range.first && code <= range.last; });
}

char32_t asciiFor(char32_t code) {
  const auto known = std::ranges::find(substitutes, code, &Substitute::sign);
  return known == substitutes.end() ? U'?' : static_cast<char32_t>(known->ascii);
}

bool isShown(char32_t code) {
  return code >= 0x20 && (code < 0x7F || code >= 0xA0) && !isUnseen(code);
}

// -1: nobody knows.
int columnsOf(char32_t code) {
  return code < 0x7F ? 1 : ::wcwidth(static_cast<wchar_t>(code));
}

Glyph replacement(CharacterSet set) {
  return {.points = {set == CharacterSet::ascii ? U'?' : U'\uFFFD'}, .columns = 1};
}

void addMark(std::vector<Glyph>& glyphs, char32_t mark) {
  if (glyphs.empty()) glyphs.push_back({});
  const auto free = std::ranges::find(glyphs.back().points, U'\0');
  if (free != glyphs.back().points.end()) *free = mark;
}

// What ASCII has does not depend on the locale.
void add(std::vector<Glyph>& glyphs, char32_t code, CharacterSet set) {
  if (!isShown(code)) return glyphs.push_back(replacement(set));
  if (set == CharacterSet::ascii)
    return glyphs.push_back({.points = {code < 0x80 ? code : asciiFor(code)}, .columns = 1});
  const int columns = columnsOf(code);
  if (columns < 0) return glyphs.push_back(replacement(set));
  if (columns == 0) return addMark(glyphs, code);
  glyphs.push_back({.points = {code}, .columns = static_cast<std::uint8_t>(columns)});
}

}  // namespace

std::vector<Glyph> glyphsOf(std::string_view text, CharacterSet set) {
  std::vector<Glyph> glyphs;
  glyphs.reserve(text.size());
  while (!text.empty()) {
    const Utf8Character next = firstCharacter(text);
    if (next.code) {
      add(glyphs, *next.code, set);
    } else {
      glyphs.push_back(replacement(set));
    }
    text.remove_prefix(next.length);
  }
  return glyphs;
}

int widthOf(std::string_view text, CharacterSet set) {
  int columns = 0;
  for (const Glyph& glyph : glyphsOf(text, set)) columns += glyph.columns;
  return columns;
}

std::string textOf(const Glyph& glyph) {
  std::string text;
  for (const char32_t point : glyph.points)
    if (point != 0) appendUtf8(text, point);
  return text;
}

}  // namespace kelvasi::terminal
