// SPDX-License-Identifier: Apache-2.0
// gzip, by zlib.
#pragma once

#include "Capture/Unpacker.h"

struct z_stream_s;

namespace kelvasi {

class GzipUnpacker : public Unpacker {
 public:
  // Throws std::bad_alloc.
  GzipUnpacker();
  Step unpack(std::span<const std::uint8_t> packed, std::span<std::uint8_t> out) override;
  const char* name() const override { return "gzip"; }

 private:
  struct End {
    void operator()(z_stream_s* stream) const;
  };
  std::unique_ptr<z_stream_s, End> stream_;
};

}  // namespace kelvasi
