// SPDX-License-Identifier: Apache-2.0
// Property lists: read by XmlReader.h and BinaryReader.h, written through libplist.
#pragma once

#include <cstdint>
#include <optional>
#include <span>

#include "Platform/PlistSerialiser.h"

namespace kelvasi {

// Reading. The bounds are those of PlistLimits.h; the readers say what else is refused. In what is accepted
// - texts are UTF-8 without NUL;
// - NUL bytes and white space behind the document are no part of it, as a peer may pad what it sends;
// - of the entries with one key the last stands, at the place of the first;
// - a date keeps its fraction of a second, which only the binary format has.
//
// Writing. What is written, `parse` and every other reader takes, and yields the value again, save that
// - a byte that is not UTF-8 and a character XML cannot hold (control characters, NUL) become U+FFFD;
// - a date loses its fraction of a second, rounded down;
// - in XML, the real -0.0 becomes 0.0.
// Nothing is returned, besides for absent values, for dates outside the years 1000 to 9999, for containers
// nested deeper than 128 levels (those that contain themselves too), and for more than 4,000,000 values or
// 256 MiB of texts and data.
//
// Neither depends on the program's locale. Safe to use from several threads at once.
class LibplistSerialiser : public PlistSerialiser {
 public:
  std::optional<PlistValue> parse(std::span<const std::uint8_t> bytes) const override;
  bool parseOver(PlistValue& value, std::span<const std::uint8_t> bytes) const override;
  std::optional<Bytes> serialiseXml(const PlistValue& value) const override;
  std::optional<Bytes> serialiseBinary(const PlistValue& value) const override;
};

}  // namespace kelvasi
