// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/BinaryTable.h"

namespace kelvasi {

namespace {
constexpr std::size_t magicSize = 8;
constexpr std::size_t trailerSize = 32;

bool isNumberSize(std::uint64_t size) {
  return size >= 1 && size <= 8;
}
}  // namespace

std::uint64_t bigEndian(std::span<const std::uint8_t> bytes) {
  std::uint64_t number = 0;
  for (const std::uint8_t byte : bytes) number = number << 8 | byte;
  return number;
}

std::optional<BinaryTable> BinaryTable::read(std::span<const std::uint8_t> document) {
  if (document.size() < magicSize + trailerSize) return std::nullopt;
  const auto body = document.first(document.size() - trailerSize);
  const auto trailer = document.last(trailerSize);
  BinaryTable table;
  table.offsetSize_ = trailer[6];
  table.referenceSize_ = trailer[7];
  table.count_ = bigEndian(trailer.subspan(8, 8));
  table.top_ = bigEndian(trailer.subspan(16, 8));
  const std::uint64_t start = bigEndian(trailer.subspan(24, 8));
  if (!isNumberSize(table.offsetSize_) || !isNumberSize(table.referenceSize_)) return std::nullopt;
  if (start <= magicSize || start > body.size()) return std::nullopt;
  if (table.top_ >= table.count_ || table.count_ > (body.size() - start) / table.offsetSize_)
    return std::nullopt;
  table.objects_ = body.first(start);
  table.offsets_ = body.subspan(start);
  return table;
}

std::span<const std::uint8_t> BinaryTable::objectAt(std::uint64_t number) const {
  if (number >= count_) return {};
  const std::uint64_t offset = bigEndian(offsets_.subspan(number * offsetSize_, offsetSize_));
  if (offset < magicSize || offset >= objects_.size()) return {};
  return objects_.subspan(offset);
}

}  // namespace kelvasi
