// SPDX-License-Identifier: Apache-2.0
// HMAC-SHA-256 (RFC 2104, FIPS 180-4).
#pragma once

#include "Platform/KeyedHash.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class HmacSha256 : public KeyedHash {
 public:
  explicit HmacSha256(Bytes key) : key_(std::move(key)) {}

  Digest of(std::span<const std::uint8_t> bytes) const override;

 private:
  Bytes key_;
};

}  // namespace kelvasi
