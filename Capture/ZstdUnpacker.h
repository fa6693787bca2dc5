// SPDX-License-Identifier: Apache-2.0
// Zstandard, by libzstd, with windows of up to 128 MiB.
#pragma once

#include "Capture/Unpacker.h"

struct ZSTD_DCtx_s;

namespace kelvasi {

class ZstdUnpacker : public Unpacker {
 public:
  // Throws std::bad_alloc.
  ZstdUnpacker();
  Step unpack(std::span<const std::uint8_t> packed, std::span<std::uint8_t> out) override;
  const char* name() const override { return "zstd"; }

 private:
  struct Free {
    void operator()(ZSTD_DCtx_s* context) const;
  };
  std::unique_ptr<ZSTD_DCtx_s, Free> context_;
};

}  // namespace kelvasi
