// SPDX-License-Identifier: Apache-2.0
// Builds a log record by the names of its fields, from the same layout that its decoder reads.
#pragma once

#include <span>
#include <stdexcept>
#include <string>
#include <string_view>

#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordLayout.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

// The header of a record with this effective log code: 13 bytes with the log type and the code, the rest
// zero.
Bytes recordHeader(LogCode logCode);

class RecordWriter {
 public:
  // A record of `logCode`, at least `length` bytes long; it grows with the fields that are set.
  RecordWriter(LogCode logCode, std::span<const Field> layout, std::size_t length = 0);
  // An entry without a header.
  explicit RecordWriter(std::span<const Field> layout, std::size_t length = 0);

  // Throws std::out_of_range when the layout has no such field or the value does not fit into it.
  RecordWriter& set(std::string_view name, std::int64_t value);
  // Bytes after those that stand, as lists of entries and property lists need.
  RecordWriter& append(std::span<const std::uint8_t> bytes);
  RecordWriter& padTo(std::size_t length);

  const Bytes& bytes() const { return bytes_; }

 private:
  std::span<const Field> layout_;
  Bytes bytes_;
};

}  // namespace kelvasi
