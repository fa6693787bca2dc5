// SPDX-License-Identifier: Apache-2.0
// Property lists as bytes.
#pragma once

#include <cstdint>
#include <optional>
#include <span>

#include "Plist/PlistValue.h"

namespace kelvasi {

class PlistSerialiser {
 public:
  virtual ~PlistSerialiser() = default;

  // Parses an XML or binary property list. Nothing when the bytes are not one, or are larger or nested deeper
  // than the implementation accepts.
  virtual std::optional<PlistValue> parse(std::span<const std::uint8_t> bytes) const = 0;
  // The same, written over a value of any kind: what nobody else holds of it may be used again, so that
  // documents of one shape need no new memory. False when the bytes are none; the value is then absent.
  virtual bool parseOver(PlistValue& value, std::span<const std::uint8_t> bytes) const {
    value = parse(bytes).value_or(PlistValue());
    return !value.isAbsent();
  }
  // An XML property list, format version 1.0. Nothing when the value, or one inside it, is absent.
  virtual std::optional<Bytes> serialiseXml(const PlistValue& value) const = 0;
  // The same as a binary property list, format version 00.
  virtual std::optional<Bytes> serialiseBinary(const PlistValue& value) const = 0;
};

}  // namespace kelvasi
