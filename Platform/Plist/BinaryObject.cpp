#include "Platform/Plist/BinaryObject.h"

#include <bit>
#include <cmath>

#include "Platform/Plist/BinaryTable.h"
#include "Platform/Plist/Utf8.h"

namespace kelvasi {

namespace {

using Span = std::span<const std::uint8_t>;

bool isSafeAscii(Span content) {
  return isCleanUtf8({reinterpret_cast<const char*>(content.data()), content.size()});
}

bool isSafeUtf16(Span content) {
  bool expectsLow = false;
  for (std::size_t at = 0; at + 1 < content.size(); at += 2) {
    const std::uint64_t unit = bigEndian(content.subspan(at, 2));
    const bool isLow = unit >= 0xdc00 && unit <= 0xdfff;
    if (unit == 0 || isLow != expectsLow) return false;
    expectsLow = unit >= 0xd800 && unit <= 0xdbff;
  }
  return !expectsLow;
}

bool isSafeInteger(const BinaryObject& object) {
  if (object.count > 4 || object.content.size() >> object.count == 0) return false;
  return object.count < 4 || bigEndian(object.content.first(8)) == 0;
}

bool isSafeDate(const BinaryObject& object) {
  if (object.count != 3 || object.content.size() < 8) return false;
  return std::isfinite(std::bit_cast<double>(bigEndian(object.content.first(8))));
}

bool isSafeReal(const BinaryObject& object) {
  return (object.count == 2 || object.count == 3) && object.content.size() >> object.count != 0;
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

bool isSafeScalar(const BinaryObject& object) {
  switch (object.kind) {
    case BinaryObject::simple:
      return object.count == 8 || object.count == 9;  // false and true
    case BinaryObject::integer:
      return isSafeInteger(object);
    case BinaryObject::real:
      return isSafeReal(object);
    case BinaryObject::date:
      return isSafeDate(object);
    default:
      return false;
  }
}

bool isSafeContent(BinaryObject::Kind kind, Span content) {
  switch (kind) {
    case BinaryObject::data:
      return true;
    case BinaryObject::ascii:
      return isSafeAscii(content);
    case BinaryObject::utf16:
      return isSafeUtf16(content);
    default:
      return false;
  }
}

}  // namespace kelvasi
