// SPDX-License-Identifier: Apache-2.0
#include "Redaction/IdentitySearch.h"

#include <algorithm>

namespace kelvasi {

namespace {

std::uint32_t windowAt(std::span<const std::uint8_t> bytes, std::size_t at) {
  return bytes[at] | bytes[at + 1] * 0x100u | bytes[at + 2] * 0x10000u;
}

std::optional<std::uint8_t> hexDigit(char character) {
  if (character >= '0' && character <= '9') return static_cast<std::uint8_t>(character - '0');
  if (character >= 'a' && character <= 'f') return static_cast<std::uint8_t>(character - 'a' + 10);
  if (character >= 'A' && character <= 'F') return static_cast<std::uint8_t>(character - 'A' + 10);
  return std::nullopt;
}

// Digits, decimal or all hexadecimal, each in half a byte; what stands between them is left out.
Bytes digitsOf(std::string_view text, bool areHexadecimal) {
  Bytes digits;
  for (const char each : text) {
    const auto digit = hexDigit(each);
    if (digit && (areHexadecimal || *digit < 10)) digits.push_back(*digit);
  }
  return digits;
}

Bytes packed(std::span<const std::uint8_t> digits, bool isSwapped) {
  Bytes bytes((digits.size() + 1) / 2);
  for (std::size_t at = 0; at < digits.size(); ++at) {
    const bool isHigh = (at % 2 == 0) != isSwapped;
    bytes[at / 2] = static_cast<std::uint8_t>(bytes[at / 2] | digits[at] << (isHigh ? 4 : 0));
  }
  return bytes;
}

Bytes asText(std::string_view text) {
  return {text.begin(), text.end()};
}

Bytes asUtf16(std::string_view text, bool isBigEndian) {
  Bytes bytes(2 * text.size());
  for (std::size_t at = 0; at < text.size(); ++at)
    bytes[2 * at + (isBigEndian ? 1 : 0)] = static_cast<std::uint8_t>(text[at]);
  return bytes;
}

// Such bits pad records and say nothing of anybody.
bool isMonotonous(std::span<const std::uint8_t> bytes) {
  return std::ranges::all_of(bytes, [&](std::uint8_t each) { return each == bytes.front(); });
}

bool isHexadecimal(std::string_view text) {
  return text.size() % 2 == 0 &&
         std::ranges::all_of(text, [](char each) { return hexDigit(each).has_value(); });
}

}  // namespace

IdentitySearch::IdentitySearch(const RemovedIdentities& identities)
    : windows_(std::size_t{1} << (8 * windowBytes)) {
  for (const std::string& text : identities.texts()) notLookedFor_ += addForms(text) ? 0 : 1;
  for (const Bytes& bytes : identities.bytes()) {
    const bool isAdded = add(bytes, 8 * bytes.size());
    notLookedFor_ += isAdded ? 0 : 1;
  }
}

bool IdentitySearch::addForms(const std::string& text) {
  const bool isAdded = add(asText(text), 8 * text.size());
  if (!isAdded) return false;
  for (const bool flag : {false, true}) {
    add(asUtf16(text, flag), 16 * text.size());
    const Bytes digits = digitsOf(text, false);
    add(packed(digits, flag), flag ? digits.size() / 2 * 8 : 4 * digits.size());
    if (isHexadecimal(text)) add(packed(digitsOf(text, true), flag), 4 * text.size());
  }
  std::string bare;
  for (const std::uint8_t digit : digitsOf(text, false)) bare += static_cast<char>('0' + digit);
  if (bare != text) add(asText(bare), 8 * bare.size());
  return true;
}

bool IdentitySearch::add(std::span<const std::uint8_t> pattern, std::size_t bits) {
  if (bits < fewestBits || isMonotonous(pattern)) return false;
  for (unsigned shift = 0; shift < 8; ++shift) {
    for (const BitOrder order : {BitOrder::mostSignificantFirst, BitOrder::leastSignificantFirst}) {
      const bool isFirst = order == BitOrder::mostSignificantFirst;
      const std::size_t taken = isFirst ? bits : bits / 8 * 8;
      if (taken < fewestBits || (!isFirst && shift == 0)) continue;
      PlacedPattern each = placed(pattern, taken, order, shift);
      const std::uint32_t window = windowAt(each.bytes, each.window);
      windows_[window] = true;
      byWindow_.emplace(window, patterns_.size());
      longest_ = std::max(longest_, each.bytes.size());
      patterns_.push_back(std::move(each));
    }
  }
  return true;
}

std::optional<std::uint64_t> IdentitySearch::look(std::span<const std::uint8_t> piece) {
  const std::size_t kept = std::min(held_.size(), 2 * longest_);
  before_ += held_.size() - kept;
  held_.erase(held_.begin(), held_.end() - static_cast<std::ptrdiff_t>(kept));
  held_.insert(held_.end(), piece.begin(), piece.end());
  const auto found = find();
  return found ? std::optional(before_ + *found) : std::nullopt;
}

std::optional<std::size_t> IdentitySearch::find() const {
  for (std::size_t at = 0; at + windowBytes <= held_.size(); ++at) {
    const std::uint32_t window = windowAt(held_, at);
    if (!windows_[window]) continue;
    const auto [first, last] = byWindow_.equal_range(window);
    for (auto entry = first; entry != last; ++entry) {
      if (isAt(patterns_[entry->second], at)) return at - patterns_[entry->second].window;
    }
  }
  return std::nullopt;
}

bool IdentitySearch::isAt(const PlacedPattern& pattern, std::size_t window) const {
  if (window < pattern.window || held_.size() - (window - pattern.window) < pattern.bytes.size())
    return false;
  const auto here = std::span(held_).subspan(window - pattern.window, pattern.bytes.size());
  for (std::size_t at = 0; at < here.size(); ++at) {
    if ((here[at] & pattern.masks[at]) != pattern.bytes[at]) return false;
  }
  return true;
}

}  // namespace kelvasi
