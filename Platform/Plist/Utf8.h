// SPDX-License-Identifier: Apache-2.0
// UTF-8 texts and the characters XML 1.0 can hold.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace kelvasi {

struct Utf8Character {
  std::optional<char32_t> code;  // nothing when the bytes are not a character
  std::size_t length = 1;        // bytes to go on by
};

// The first character of a text that is not empty.
Utf8Character firstCharacter(std::string_view text);

// Whether a text is UTF-8 throughout and free of NUL.
bool isCleanUtf8(std::string_view text);

// Whether there is a character of this code.
bool isScalarValue(char32_t code);
// Appends the character of a code that is a scalar value.
void appendUtf8(std::string& text, char32_t code);

// The text with every byte that is not UTF-8, and every character XML 1.0 cannot hold (section 2.2), replaced
// by U+FFFD.
std::string asXmlText(std::string_view text);

}  // namespace kelvasi
