#include "Capture/DlfReader.h"

#include <algorithm>
#include <utility>

#include "Capture/PlistBeginning.h"
#include "LogGenerator/RecordView.h"

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

}  // namespace

DlfReader::DlfReader(InputBytes& input)
    : name_(input.name()), file_(input.readToEnd(largestFile, "a DLF file")) {
  fault_ = input.fault();
  if (!fault_) findRecords();
}

DlfReader::DlfReader(std::string name, Bytes file) : name_(std::move(name)), file_(std::move(file)) {
  findRecords();
}

void DlfReader::findRecords() {
  records_ = findDlfRecords(file_);
  const std::size_t end = records_.empty() ? 0 : records_.back().end;
  if (end < file_.size()) faultAtEnd_ = CaptureFault{name_, end, "no whole DLF record begins here"};
  if (!records_.empty() && isVersionReport(records_.front())) nextRecord_ = 1;
  for (std::size_t at = nextRecord_; at < records_.size(); ++at) {
    const auto stamp = stampOf(records_[at]);
    if (!stamp) continue;
    time_ = *stamp;
    break;
  }
}

std::optional<CapturedMessage> DlfReader::next() {
  if (nextRecord_ == records_.size()) {
    if (faultAtEnd_) fault_ = std::exchange(faultAtEnd_, std::nullopt);
    return std::nullopt;
  }
  const DlfRecordPlace& place = records_[nextRecord_++];
  time_ = stampOf(place).value_or(time_);
  return CapturedMessage{.bytes = messageOf(place), .arrival = time_};
}

bool DlfReader::isVersionReport(const DlfRecordPlace& place) const {
  return RecordView(file_).u16(place.record + logCodeOffset) == versionReportLogCode;
}

std::optional<nanoseconds> DlfReader::stampOf(const DlfRecordPlace& place) const {
  const RecordView stamp = RecordView(file_).from(place.record + stampOffset);
  const std::uint64_t value = stamp.u32(0) | std::uint64_t{stamp.u32(4)} << 32;
  return value == 0 ? std::nullopt : std::optional(fromSystemTime(value));
}

std::span<const std::uint8_t> DlfReader::messageOf(const DlfRecordPlace& place) {
  const auto whole = std::span<const std::uint8_t>(file_).subspan(place.begin, place.end - place.begin);
  const std::size_t lead = place.record - place.begin;
  if (lead == 2) return whole.subspan(1);  // what is left of a prefix
  if (lead != 0) return whole;
  typed_.assign(1, beginsAsPlist(whole.subspan(dlfRecordHeaderSize)) ? 0xFF : 0x01);
  typed_.insert(typed_.end(), whole.begin(), whole.end());
  return typed_;
}

}  // namespace kelvasi
