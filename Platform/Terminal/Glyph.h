// SPDX-License-Identifier: Apache-2.0
// Text as cells of a terminal: characters with their marks, each as wide as it is drawn. Nothing that comes
// out of here moves a cursor, turns a line around or is invisible.
#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace kelvasi::terminal {

enum class CharacterSet : std::uint8_t { ascii, utf8 };

// A character and up to two combining marks; 0 where there is none.
struct Glyph {
  std::array<char32_t, 3> points{U' '};
  std::uint8_t columns = 1;  // 1 or 2

  bool operator==(const Glyph&) const = default;
};

// Characters that control, turn around or join are replaced, as are bytes that are no UTF-8, by U+FFFD or
// "?". In ASCII so is everything that has no sign there; some signs have: "-" for a minus. Marks past the
// second are left out. Widths are those of the C locale that is set, which is to be one of UTF-8 unless `set`
// is ASCII.
std::vector<Glyph> glyphsOf(std::string_view text, CharacterSet set);
// Columns.
int widthOf(std::string_view text, CharacterSet set);
// As UTF-8.
std::string textOf(const Glyph& glyph);

}  // namespace kelvasi::terminal
