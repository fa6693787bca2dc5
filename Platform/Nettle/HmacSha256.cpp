// SPDX-License-Identifier: Apache-2.0
#include "Platform/Nettle/HmacSha256.h"

#include <nettle/hmac.h>

namespace kelvasi {

KeyedHash::Digest HmacSha256::of(std::span<const std::uint8_t> bytes) const {
  hmac_sha256_ctx context;
  hmac_sha256_set_key(&context, key_.size(), key_.data());
  hmac_sha256_update(&context, bytes.size(), bytes.data());
  Digest digest;
  hmac_sha256_digest(&context, digest.size(), digest.data());
  return digest;
}

}  // namespace kelvasi
