// SPDX-License-Identifier: Apache-2.0
#include "Capture/PlistEnd.h"

#include <algorithm>
#include <string_view>

namespace kelvasi {

namespace {

using namespace std::literals;

constexpr auto byteOrderMark = "\xef\xbb\xbf"sv;
constexpr auto binaryMagic = "bplist00"sv;
constexpr auto openingTag = "<plist"sv;

// Whether one of them is where the other begins.
bool agree(std::string_view one, std::string_view other) {
  return one.starts_with(other) || other.starts_with(one);
}

std::uint64_t bigEndian(std::string_view digits) {
  std::uint64_t value = 0;
  for (const char digit : digits) value = value << 8 | static_cast<std::uint8_t>(digit);
  return value;
}

// A whole one ends with the offsets of its objects and a trailer that says where these begin, how many they
// are and how wide each is.
bool hasTrailer(std::string_view document) {
  constexpr std::size_t trailerSize = 32;
  if (document.size() < binaryMagic.size() + trailerSize) return false;
  const std::string_view trailer = document.substr(document.size() - trailerSize);
  const std::uint64_t width = bigEndian(trailer.substr(6, 1));
  const std::uint64_t count = bigEndian(trailer.substr(8, 8));
  const std::uint64_t begin = bigEndian(trailer.substr(24, 8));
  if (begin > document.size() || count > document.size()) return false;
  return begin + count * width + trailerSize == document.size();
}

// Where the first element begins, behind declarations.
std::string_view fromFirstElement(std::string_view text) {
  const auto isElement = [](char first, char second) {
    return first == '<' && second != '?' && second != '!';
  };
  const auto place = std::ranges::adjacent_find(text, isElement);
  return text.substr(static_cast<std::size_t>(place - text.begin()));
}

}  // namespace

bool endsTooEarly(std::span<const std::uint8_t> document) {
  std::string_view text(reinterpret_cast<const char*>(document.data()), document.size());
  if (text.starts_with(binaryMagic)) return !hasTrailer(text);
  if (byteOrderMark.starts_with(text)) return true;
  if (text.starts_with(byteOrderMark)) text.remove_prefix(byteOrderMark.size());
  text.remove_prefix(std::min(text.find_first_not_of(" \t\r\n"), text.size()));
  if (agree(text, binaryMagic)) return true;
  return text.starts_with('<') && agree(fromFirstElement(text), openingTag) &&
         text.find("</plist>") == std::string_view::npos;
}

}  // namespace kelvasi
