// SPDX-License-Identifier: Apache-2.0
#include "Capture/PlistBeginning.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace kelvasi {

namespace {

using namespace std::literals;

constexpr std::array beginnings{"bplist"sv, "<?xml"sv, "<!DOCTYPE plist"sv, "<plist"sv};
constexpr std::size_t longestBeginning = std::ranges::max(beginnings, {}, &std::string_view::size).size();
constexpr auto byteOrderMark = "\xef\xbb\xbf"sv;
constexpr auto blanks = " \t\r\n"sv;

bool beginsWith(std::span<const std::uint8_t> bytes, std::string_view beginning) {
  const auto isSame = [](std::uint8_t byte, char character) {
    return byte == static_cast<std::uint8_t>(character);
  };
  return bytes.size() >= beginning.size() &&
         std::ranges::equal(bytes.first(beginning.size()), beginning, isSame);
}

bool hasBlankAt(InputBytes& input, std::size_t at) {
  const auto bytes = input.firstBytes(at + 1);
  return at < bytes.size() && blanks.find(static_cast<char>(bytes[at])) != std::string_view::npos;
}

}  // namespace

bool beginsAsPlist(std::span<const std::uint8_t> bytes) {
  return std::ranges::any_of(beginnings, [&](auto beginning) { return beginsWith(bytes, beginning); });
}

// No further than it takes, so that nobody waits for bytes of a pipe that tell nothing.
bool beginsAsPlist(InputBytes& input) {
  const bool isMarked = beginsWith(input.firstBytes(byteOrderMark.size()), byteOrderMark);
  std::size_t at = isMarked ? byteOrderMark.size() : 0;
  while (hasBlankAt(input, at)) ++at;
  return beginsAsPlist(input.firstBytes(at + longestBeginning).subspan(at));
}

}  // namespace kelvasi
