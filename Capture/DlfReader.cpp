// SPDX-License-Identifier: Apache-2.0
#include "Capture/DlfReader.h"

#include <algorithm>
#include <utility>

#include "Capture/PlistBeginning.h"
namespace kelvasi {

namespace {

using std::chrono::nanoseconds;

constexpr std::uint16_t versionReportLogCode = 0x1FFD;
constexpr std::size_t logCodeOffset = 2;
constexpr std::size_t stampOffset = 4;

constexpr std::uint64_t stampsPerSecond = 800ull << 16;
constexpr std::chrono::seconds systemTimeBegin{315'964'800};  // 6 January 1980
constexpr std::uint64_t latestSecond = 8'000'000'000;         // keeps sums within 64 bits of nanoseconds

nanoseconds fromSystemTime(std::uint64_t stamp) {
  const std::uint64_t second = std::min(stamp / stampsPerSecond, latestSecond);
  const std::uint64_t fraction = stamp % stampsPerSecond * 1'000'000'000 / stampsPerSecond;
  return systemTimeBegin + std::chrono::seconds(second) + nanoseconds(fraction);
}

// Further than this nobody looks for the first stamp.
constexpr std::size_t mostLookedThrough = std::size_t{16} << 20;

}  // namespace

DlfReader::DlfReader(std::unique_ptr<InputBytes> input)
    : name_(input->name()), input_(std::move(input)), bytes_(input_->bytes()), records_(bytes_) {
  begin();
}

DlfReader::DlfReader(std::string name, Bytes file)
    : name_(std::move(name)), held_(std::move(file)), bytes_(*held_), records_(bytes_) {
  begin();
}

void DlfReader::begin() {
  records_.findMore();
  if (!records_.found().empty() && isVersionReport(records_.found().front())) records_.take();
  while (!findFirstStamp() && records_.held() < mostLookedThrough && records_.findMore()) {
  }
}

bool DlfReader::findFirstStamp() {
  for (const DlfRecordPlace& place : records_.found()) {
    const auto stamp = stampOf(place);
    if (!stamp) continue;
    time_ = *stamp;
    return true;
  }
  return false;
}

std::optional<CapturedMessage> DlfReader::next() {
  if (records_.found().empty() && !records_.findMore()) {
    end();
    return std::nullopt;
  }
  const DlfRecordPlace place = records_.take();
  time_ = stampOf(place).value_or(time_);
  return CapturedMessage{.bytes = messageOf(place), .arrival = time_};
}

void DlfReader::end() {
  fault_ = bytes_.fault();
  if (fault_) return;
  if (records_.bytesRead() == 0) fault_ = CaptureFault{name_, 0, "an empty file"};
  if (records_.end() < records_.bytesRead())
    fault_ = CaptureFault{name_, records_.end(), "no whole DLF record begins here"};
}

RecordView DlfReader::recordAt(const DlfRecordPlace& place) const {
  return RecordView(records_.bytes(place.record, place.end));
}

bool DlfReader::isVersionReport(const DlfRecordPlace& place) const {
  return recordAt(place).u16(logCodeOffset) == versionReportLogCode;
}

std::optional<nanoseconds> DlfReader::stampOf(const DlfRecordPlace& place) const {
  const RecordView stamp = recordAt(place).from(stampOffset);
  const std::uint64_t value = stamp.u32(0) | std::uint64_t{stamp.u32(4)} << 32;
  return value == 0 ? std::nullopt : std::optional(fromSystemTime(value));
}

std::span<const std::uint8_t> DlfReader::messageOf(const DlfRecordPlace& place) {
  const auto whole = records_.bytes(place.begin, place.end);
  const std::uint64_t lead = place.record - place.begin;
  if (lead == 2) return whole.subspan(1);  // what is left of a prefix
  if (lead != 0) return whole;
  typed_.assign(1, beginsAsPlist(whole.subspan(dlfRecordHeaderSize)) ? 0xFF : 0x01);
  typed_.insert(typed_.end(), whole.begin(), whole.end());
  return typed_;
}

}  // namespace kelvasi
