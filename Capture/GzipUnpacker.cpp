// SPDX-License-Identifier: Apache-2.0
#include "Capture/GzipUnpacker.h"

#define ZLIB_CONST  // input is not written to
#include <zlib.h>

#include <algorithm>
#include <limits>
#include <new>

namespace kelvasi {

namespace {

constexpr int gzipOnly = MAX_WBITS + 16;

uInt shorten(std::size_t size) {
  return static_cast<uInt>(std::min<std::size_t>(size, std::numeric_limits<uInt>::max()));
}

}  // namespace

void GzipUnpacker::End::operator()(z_stream_s* stream) const {
  ::inflateEnd(stream);
  const std::unique_ptr<z_stream_s> owned(stream);
}

GzipUnpacker::GzipUnpacker() : stream_(std::make_unique<z_stream_s>().release()) {
  if (inflateInit2(stream_.get(), gzipOnly) != Z_OK) throw std::bad_alloc();
}

Unpacker::Step GzipUnpacker::unpack(std::span<const std::uint8_t> packed, std::span<std::uint8_t> out) {
  const uInt inSize = shorten(packed.size());
  const uInt outSize = shorten(out.size());
  stream_->next_in = packed.data();
  stream_->avail_in = inSize;
  stream_->next_out = out.data();
  stream_->avail_out = outSize;
  const int outcome = ::inflate(stream_.get(), Z_NO_FLUSH);
  Step step;
  step.taken = inSize - stream_->avail_in;
  step.given = outSize - stream_->avail_out;
  if (outcome == Z_STREAM_END) {
    step.isComplete = true;
    ::inflateReset(stream_.get());
  } else if (outcome != Z_OK && outcome != Z_BUF_ERROR) {
    step.fault = stream_->msg ? stream_->msg : "no gzip data";
  }
  return step;
}

}  // namespace kelvasi
