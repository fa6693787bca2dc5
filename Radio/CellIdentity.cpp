// SPDX-License-Identifier: Apache-2.0
#include "Radio/CellIdentity.h"

#include <charconv>

namespace kelvasi {

namespace {

void appendNumber(std::string& text, std::int64_t number) {
  std::array<char, 24> digits;
  text.append(digits.data(), std::to_chars(digits.data(), digits.data() + digits.size(), number).ptr);
}

}  // namespace

void appendTo(std::string& text, const CellIdentity& cell) {
  if (!cell) return;
  text += nameOf(cell.family);
  text += ':';
  if (cell.channel == CellIdentity::unknown) {
    text += '?';
  } else {
    appendNumber(text, cell.channel);
  }
  if (cell.code == CellIdentity::unknown) return;
  text += '/';
  appendNumber(text, cell.code);
}

std::string textOf(const CellIdentity& cell) {
  std::string text;
  appendTo(text, cell);
  return text;
}

}  // namespace kelvasi
