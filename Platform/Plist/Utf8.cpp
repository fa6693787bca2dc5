// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/Utf8.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>

namespace kelvasi {

namespace {

struct Form {
  unsigned char mask, lead;  // a first byte has this form when byte & mask == lead
  std::size_t length;
  char32_t least;  // a smaller code must be written shorter
};
constexpr Form forms[] = {
    {0x80, 0x00, 1, 0}, {0xe0, 0xc0, 2, 0x80}, {0xf0, 0xe0, 3, 0x800}, {0xf8, 0xf0, 4, 0x10000}};

unsigned char byteAt(std::string_view text, std::size_t at) {
  return static_cast<unsigned char>(text[at]);
}

bool isXmlCharacter(char32_t code) {
  return code >= 0x20 ? code != 0xfffe && code != 0xffff : code == '\t' || code == '\n' || code == '\r';
}

Utf8Character read(std::string_view text, const Form& form) {
  if (text.size() < form.length) return {};
  char32_t code = byteAt(text, 0) & static_cast<unsigned char>(~form.mask);
  for (std::size_t at = 1; at < form.length; ++at) {
    if ((byteAt(text, at) & 0xc0) != 0x80) return {};
    code = code << 6 | (byteAt(text, at) & 0x3f);
  }
  if (code < form.least || !isScalarValue(code)) return {};
  return {code, form.length};
}

// Of so many characters at once whether all are ASCII and none is NUL. A byte of `less` has its highest bit
// set where the character is NUL or no ASCII; behind a NUL others may have, too.
template <std::size_t count>
bool isAscii(const char* characters) {
  constexpr std::uint64_t highest = 0x8080808080808080;
  constexpr std::uint64_t ones = 0x0101010101010101;
  std::array<std::uint64_t, count / sizeof(std::uint64_t)> words;
  std::memcpy(words.data(), characters, sizeof words);
  std::uint64_t marks = 0;
  for (const std::uint64_t word : words) marks |= (word - ones) | word;
  return (marks & highest) == 0;
}

// Most texts are nothing else, and need no closer look.
std::size_t asciiPrefix(std::string_view text) {
  std::size_t size = 0;
  while (size + 64 <= text.size() && isAscii<64>(text.data() + size)) size += 64;
  while (size + 8 <= text.size() && isAscii<8>(text.data() + size)) size += 8;
  const auto isOther = [](unsigned char byte) { return byte == 0 || byte >= 0x80; };
  return static_cast<std::size_t>(std::ranges::find_if(text.substr(size), isOther) - text.begin());
}

}  // namespace

bool isScalarValue(char32_t code) {
  return code <= 0x10ffff && (code < 0xd800 || code > 0xdfff);
}

void appendUtf8(std::string& text, char32_t code) {
  const auto form = std::find_if(std::rbegin(forms), std::rend(forms),
                                 [&](const Form& each) { return code >= each.least; });
  unsigned shift = static_cast<unsigned>(form->length - 1) * 6;
  const auto payload = static_cast<unsigned char>(~form->mask);
  text += static_cast<char>(form->lead | (code >> shift & payload));
  while (shift != 0) {
    shift -= 6;
    text += static_cast<char>(0x80 | (code >> shift & 0x3f));
  }
}

Utf8Character firstCharacter(std::string_view text) {
  for (const Form& form : forms) {
    if ((byteAt(text, 0) & form.mask) == form.lead) return read(text, form);
  }
  return {};
}

bool isCleanUtf8(std::string_view text) {
  while (true) {
    text.remove_prefix(asciiPrefix(text));
    if (text.empty()) return true;
    const Utf8Character character = firstCharacter(text);
    if (!character.code || *character.code == 0) return false;
    text.remove_prefix(character.length);
  }
}

std::string asXmlText(std::string_view text) {
  std::string result;
  result.reserve(text.size());
  while (!text.empty()) {
    const Utf8Character character = firstCharacter(text);
    const bool stands = character.code && isXmlCharacter(*character.code);
    result += stands ? text.substr(0, character.length) : "\uFFFD";
    text.remove_prefix(character.length);
  }
  return result;
}

}  // namespace kelvasi
