// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/BinaryObject.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <string>
#include <string_view>

#include "Platform/Plist/BinaryTable.h"
#include "Platform/Plist/Utf8.h"

namespace kelvasi {

namespace {

using Span = std::span<const std::uint8_t>;

constexpr double from1970To2001 = 978307200;

PlistValue asciiText(Span content) {
  const std::string_view text(reinterpret_cast<const char*>(content.data()), content.size());
  return isCleanUtf8(text) ? PlistValue(text) : PlistValue();
}

PlistValue utf16Text(Span content) {
  std::string text;
  char32_t high = 0;  // the first of a pair, until the second comes
  for (std::size_t at = 0; at + 1 < content.size(); at += 2) {
    const auto unit = static_cast<char32_t>(bigEndian(content.subspan(at, 2)));
    const bool isLow = unit >= 0xdc00 && unit <= 0xdfff;
    if (unit == 0 || isLow != (high != 0)) return {};
    const bool isHigh = unit >= 0xd800 && unit <= 0xdbff;
    if (!isHigh) appendUtf8(text, isLow ? 0x10000 + ((high & 0x3ff) << 10) + (unit & 0x3ff) : unit);
    high = isHigh ? unit : 0;
  }
  return high == 0 ? PlistValue(std::move(text)) : PlistValue();
}

// Up to four bytes without a sign, eight with one; sixteen for those beyond.
PlistValue integerOf(const BinaryObject& object) {
  const std::size_t size = std::size_t{1} << object.count;
  if (object.count > 4 || object.content.size() < size) return {};
  const std::uint64_t number = bigEndian(object.content.first(size).last(std::min<std::size_t>(size, 8)));
  if (object.count == 3) return static_cast<std::int64_t>(number);
  if (object.count == 4 && bigEndian(object.content.first(8)) != 0) return {};
  return number;
}

PlistValue realOf(const BinaryObject& object) {
  if (object.count == 2 && object.content.size() >= 4)
    return double{std::bit_cast<float>(static_cast<std::uint32_t>(bigEndian(object.content.first(4))))};
  if (object.count == 3 && object.content.size() >= 8)
    return std::bit_cast<double>(bigEndian(object.content.first(8)));
  return {};
}

PlistValue dateOf(const BinaryObject& object) {
  if (object.count != 3 || object.content.size() < 8) return {};
  const auto seconds = std::bit_cast<double>(bigEndian(object.content.first(8)));
  return std::isfinite(seconds) ? PlistValue(PlistDate{seconds + from1970To2001}) : PlistValue();
}

PlistValue flagOf(const BinaryObject& object) {
  constexpr std::uint64_t no = 8;
  constexpr std::uint64_t yes = 9;
  return object.count == no || object.count == yes ? PlistValue(object.count == yes) : PlistValue();
}

}  // namespace

std::optional<BinaryObject> binaryObjectIn(Span bytes) {
  if (bytes.empty()) return std::nullopt;
  const unsigned first = bytes[0];
  BinaryObject object{BinaryObject::Kind{first >> 4}, first & 0xf, bytes.subspan(1)};
  if (!object.isCounted() || object.count != 0xf) return object;
  if (object.content.empty() || object.content[0] < 0x10 || object.content[0] > 0x13) return std::nullopt;
  const std::size_t size = std::size_t{1} << (object.content[0] & 0xfu);
  if (object.content.size() < 1 + size) return std::nullopt;
  object.count = bigEndian(object.content.subspan(1, size));
  object.content = object.content.subspan(1 + size);
  return object;
}

PlistValue scalarOf(const BinaryObject& object) {
  switch (object.kind) {
    case BinaryObject::simple:
      return flagOf(object);
    case BinaryObject::integer:
      return integerOf(object);
    case BinaryObject::real:
      return realOf(object);
    case BinaryObject::date:
      return dateOf(object);
    default:
      return {};
  }
}

PlistValue contentOf(BinaryObject::Kind kind, Span content) {
  switch (kind) {
    case BinaryObject::data:
      return Bytes(content.begin(), content.end());
    case BinaryObject::ascii:
      return asciiText(content);
    case BinaryObject::utf16:
      return utf16Text(content);
    default:
      return {};
  }
}

}  // namespace kelvasi
