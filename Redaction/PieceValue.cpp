// SPDX-License-Identifier: Apache-2.0
#include "Redaction/PieceValue.h"

#include <algorithm>
#include <charconv>
#include <string_view>

namespace kelvasi {

namespace {

using Form = PlistPiece::Form;

constexpr std::string_view base64Digits = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
constexpr std::string_view blanks = " \t\r\n";

std::string characters(std::span<const std::uint8_t> bytes) {
  return {bytes.begin(), bytes.end()};
}

// Without white space around it.
std::span<std::uint8_t> trimmed(std::span<std::uint8_t> bytes) {
  const std::string text = characters(bytes);
  const std::size_t first = text.find_first_not_of(blanks);
  if (first == std::string::npos) return {};
  return bytes.subspan(first, text.find_last_not_of(blanks) + 1 - first);
}

std::size_t digitOf(std::uint8_t character) {
  return base64Digits.find(static_cast<char>(character));
}

}  // namespace

std::string textIn(const PlistPiece& piece) {
  if (piece.form == Form::text) return characters(piece.bytes);
  std::string text;
  if (piece.form != Form::utf16) return text;
  for (std::size_t at = 0; at + 1 < piece.bytes.size(); at += 2) {
    const bool isAscii = piece.bytes[at] == 0 && piece.bytes[at + 1] < 0x80;
    text += static_cast<char>(isAscii ? piece.bytes[at + 1] : 0x80);
  }
  return text;
}

std::optional<std::uint64_t> numberIn(const PlistPiece& piece) {
  std::uint64_t number = 0;
  if (piece.form == Form::decimal) {
    std::string text = characters(trimmed(piece.bytes));
    const bool isHexadecimal = text.starts_with("0x") || text.starts_with("0X");
    const char* const first = text.data() + (isHexadecimal ? 2 : 0);
    const char* const last = text.data() + text.size();
    const auto [end, error] = std::from_chars(first, last, number, isHexadecimal ? 16 : 10);
    return error == std::errc() && end == last ? std::optional(number) : std::nullopt;
  }
  if (piece.form != Form::binary || piece.isData || piece.bytes.size() > 8) return std::nullopt;
  for (const std::uint8_t byte : piece.bytes) number = number << 8 | byte;
  return number;
}

Bytes dataIn(const PlistPiece& piece) {
  if (piece.form == Form::binary && piece.isData) return {piece.bytes.begin(), piece.bytes.end()};
  Bytes data;
  if (piece.form != Form::base64) return data;
  std::uint32_t group = 0;
  unsigned bits = 0;
  for (const std::uint8_t each : piece.bytes) {
    const std::size_t digit = digitOf(each);
    if (digit == std::string_view::npos) continue;
    group = group << 6 | static_cast<std::uint32_t>(digit);
    bits += 6;
    if (bits < 8) continue;
    bits -= 8;
    data.push_back(static_cast<std::uint8_t>(group >> bits));
  }
  return data;
}

void writeText(const PlistPiece& piece, std::string_view text) {
  if (piece.form == Form::text) {
    std::ranges::copy(text, piece.bytes.begin());
    return;
  }
  for (std::size_t at = 0; at < text.size(); ++at) {
    piece.bytes[2 * at] = 0;
    piece.bytes[2 * at + 1] = static_cast<std::uint8_t>(text[at]);
  }
}

void writeNumber(const PlistPiece& piece, std::uint64_t number) {
  if (piece.form == Form::decimal) {
    const auto place = trimmed(piece.bytes);
    const std::string text = std::to_string(number);
    const std::string digits = text.size() > place.size() ? std::string(1, '0') : text;
    std::ranges::fill(place, std::uint8_t{' '});
    std::ranges::copy(digits, place.end() - static_cast<std::ptrdiff_t>(digits.size()));
    return;
  }
  for (std::size_t at = piece.bytes.size(); at > 0; --at, number >>= 8)
    piece.bytes[at - 1] = static_cast<std::uint8_t>(number);
}

void writeData(const PlistPiece& piece, std::span<const std::uint8_t> data) {
  if (piece.form == Form::binary) {
    std::ranges::copy(data, piece.bytes.begin());
    return;
  }
  std::size_t bit = 0;
  for (std::uint8_t& each : piece.bytes) {
    if (digitOf(each) == std::string_view::npos) continue;
    const auto byteAt = [&](std::size_t at) { return at < data.size() ? data[at] : std::uint8_t{0}; };
    const unsigned pair = byteAt(bit / 8) * 0x100u | byteAt(bit / 8 + 1);
    each = static_cast<std::uint8_t>(base64Digits[pair >> (10 - bit % 8) & 0x3F]);
    bit += 6;
  }
}

}  // namespace kelvasi
