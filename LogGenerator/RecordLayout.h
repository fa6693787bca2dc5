// SPDX-License-Identifier: Apache-2.0
// The layout of a record, declared once and read by both its decoder and the simulated daemon's encoder.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

#include "LogGenerator/RecordView.h"

namespace kelvasi {

struct Field {
  std::string_view name;
  std::size_t byte = 0;  // from the start of the record, or of the entry that the layout describes
  unsigned bit = 0;      // within that byte, 0 the least significant
  unsigned width = 8;    // bits, 1 to 32
  bool isSigned = false;
  bool isBigEndian = false;  // whole 16-bit fields only

  constexpr std::size_t firstBit() const { return byte * 8 + bit; }
  constexpr std::size_t endBit() const { return firstBit() + width; }
};

// The place of the field of this name; does not compile when the layout has none.
consteval std::size_t indexIn(std::span<const Field> layout, std::string_view name) {
  for (std::size_t place = 0; place < layout.size(); ++place) {
    if (layout[place].name == name) return place;
  }
  throw "no such field in this layout";
}

// The field of this name itself.
consteval Field fieldIn(std::span<const Field> layout, std::string_view name) {
  return layout[indexIn(layout, name)];
}

// Whether the fields stand in the order of their bits and none overlaps another.
consteval bool inWireOrder(std::span<const Field> layout) {
  for (std::size_t place = 0; place + 1 < layout.size(); ++place) {
    if (layout[place].endBit() > layout[place + 1].firstBit()) return false;
  }
  return true;
}

// The field's value, sign-extended where it is signed.
constexpr std::int64_t valueOf(RecordView record, const Field& field) {
  std::uint32_t raw = record.bits(field.byte, field.bit, field.width);
  if (field.isBigEndian) raw = ((raw & 0xFF) << 8) | (raw >> 8);
  const std::int64_t value = raw;
  return field.isSigned && ((raw >> (field.width - 1)) & 1) != 0 ? value - (std::int64_t{1} << field.width)
                                                                 : value;
}

}  // namespace kelvasi
