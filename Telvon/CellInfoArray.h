// SPDX-License-Identifier: Apache-2.0
// The telephony daemon's cell list, as its cell-information record carries it.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

#include "Platform/Platform.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class CellInfoArray {
 public:
  // Parses a record's payload. When that fails the object holds nothing and the system log says so.
  CellInfoArray(const Platform& platform, std::span<const std::uint8_t> payload);

  // Whether the payload was no property list at all.
  bool holdsNothing() const { return parsed_.isAbsent(); }
  // Null when there is no list: the payload did not parse, or is no array.
  const PlistArray* cells() const { return parsed_.array(); }

 private:
  PlistValue parsed_;
};

// Whether a cell has both a technology and a type entry, equal to these.
bool isCell(const PlistDictionary& cell, std::string_view technology, std::string_view type);

// A number of a cell, an integer or a whole real; nothing when it is missing, no number, or does not fit into
// 32 bits with sign.
std::optional<std::int32_t> cellNumber(const PlistDictionary& cell, std::string_view key);

}  // namespace kelvasi
