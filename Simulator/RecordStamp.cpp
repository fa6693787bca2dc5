// SPDX-License-Identifier: Apache-2.0
#include "Simulator/RecordStamp.h"

#include <array>
#include <cstdint>

#include "LogGenerator/RecordView.h"

namespace kelvasi::sim {

namespace {

constexpr std::size_t lengthAt = 1;
constexpr std::size_t timeAt = 5;  // eight bytes: 16 bits of a fraction of 1.25 ms, then the count of these
constexpr std::int64_t frameMicroseconds = 1250;
constexpr std::int64_t fractions = 65536;

constexpr std::chrono::seconds systemTimeEpoch{315964800};  // 6 January 1980, since 1970

void put(Bytes& record, std::size_t at, std::uint64_t value, std::size_t size) {
  for (std::size_t place = 0; place < size; ++place, value >>= 8)
    record[at + place] = static_cast<std::uint8_t>(value);
}

}  // namespace

void stampRecord(Bytes& record, WorldTime at) {
  if (record.size() < RecordView::headerSize) return;
  put(record, lengthAt, record.size() - lengthAt, 2);
  const std::int64_t time = (WorldTime(worldEpoch - systemTimeEpoch) + at).count();
  const std::int64_t frames = time / frameMicroseconds;
  const std::int64_t fraction = time % frameMicroseconds * fractions / frameMicroseconds;
  put(record, timeAt, static_cast<std::uint64_t>(frames * fractions + fraction), 8);
}

}  // namespace kelvasi::sim
