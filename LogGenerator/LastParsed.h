// SPDX-License-Identifier: Apache-2.0
// Remembers what the last bytes parsed gave, so that the decoders that read one record parse it once.
//
// What it hands out is shared: readers may pass parts of it on, and change none of it. What they have let go
// of by the next list of the same kind is written over: lists whose first keys are the same. For one thread.
#pragma once

#include <string>
#include <vector>

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
  struct Kind {
    std::string firstKey;
    bool hasParsed = false;
    Bytes bytes;
    PlistValue parsed;  // absent: no property list
  };

  Kind& kindOf(std::string_view firstKey) const;

  const PlistSerialiser& serialiser_;
  mutable std::vector<Kind> kinds_;
};

}  // namespace kelvasi
