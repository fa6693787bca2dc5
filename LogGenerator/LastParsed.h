// SPDX-License-Identifier: Apache-2.0
// Remembers what the last bytes parsed gave, so that the decoders that read one record parse it once.
//
// What it hands out is shared: readers may pass parts of it on, and change none of it. What they have let go
// of by the next record is written over. For one thread.
#pragma once

#include "Platform/PlistSerialiser.h"

namespace kelvasi {

class LastParsed : public PlistSerialiser {
 public:
  // `serialiser` outlives this object.
  explicit LastParsed(const PlistSerialiser& serialiser) : serialiser_(serialiser) {}

  std::optional<PlistValue> parse(std::span<const std::uint8_t> bytes) const override;
  std::optional<Bytes> serialiseXml(const PlistValue& value) const override {
    return serialiser_.serialiseXml(value);
  }
  std::optional<Bytes> serialiseBinary(const PlistValue& value) const override {
    return serialiser_.serialiseBinary(value);
  }

 private:
  const PlistSerialiser& serialiser_;
  mutable bool hasParsed_ = false;
  mutable Bytes bytes_;
  mutable PlistValue parsed_;  // absent: no property list
};

}  // namespace kelvasi
