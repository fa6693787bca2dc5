// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/RecordFraming.h"

namespace kelvasi {

namespace {
constexpr std::uint8_t prefixMark = 0x81;
constexpr std::size_t prefixSize = 2;
constexpr std::size_t logCodeOffset = 3;
}  // namespace

std::optional<FramedRecord> frameRecord(std::span<const std::uint8_t> message) {
  if (message.size() < RecordView::headerSize) return std::nullopt;
  const RecordView record(message.front() == prefixMark ? message.subspan(prefixSize) : message);
  const std::uint8_t logType = record.byteAt(0);
  const LogCode code = record.u16(logCodeOffset);
  return FramedRecord{
      .record = record, .logType = logType, .logCode = logType == 0xFF ? code | extraLogCodes : code};
}

}  // namespace kelvasi
