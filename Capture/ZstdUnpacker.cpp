// SPDX-License-Identifier: Apache-2.0
#include "Capture/ZstdUnpacker.h"

#include <zstd.h>

#include <new>

namespace kelvasi {

void ZstdUnpacker::Free::operator()(ZSTD_DCtx_s* context) const {
  ZSTD_freeDCtx(context);
}

ZstdUnpacker::ZstdUnpacker() : context_(ZSTD_createDCtx()) {
  if (!context_) throw std::bad_alloc();
}

Unpacker::Step ZstdUnpacker::unpack(std::span<const std::uint8_t> packed, std::span<std::uint8_t> out) {
  ZSTD_inBuffer from{packed.data(), packed.size(), 0};
  ZSTD_outBuffer to{out.data(), out.size(), 0};
  const std::size_t outcome = ZSTD_decompressStream(context_.get(), &to, &from);
  Step step;
  step.taken = from.pos;
  step.given = to.pos;
  step.isComplete = outcome == 0;
  if (ZSTD_isError(outcome) != 0) step.fault = ZSTD_getErrorName(outcome);
  return step;
}

}  // namespace kelvasi
