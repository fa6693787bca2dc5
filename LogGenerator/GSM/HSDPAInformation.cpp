// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/HSDPAInformation.h"

#include "LogGenerator/GSM/HARQStatistics.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{harqStatistics::logCode};
constexpr StateSection section{.name = "HSDPA Info", .trace = "HSDPA Info", .logCodes = logCodes};

}  // namespace

HSDPAInformation::HSDPAInformation(const Platform& platform) : StateDecoder(platform, section) {}

// Another code goes without a line in the system log, and a count of 0 leaves the list of before.
Outcome HSDPAInformation::decodeOther(RecordView record, LogCode logCode) {
  using namespace harqStatistics;
  if (logCode != harqStatistics::logCode) return Outcome::notAskedFor;
  if (record.size() < minimumLength) return Outcome::tooShort;
  if (!sectionRows()) return Outcome::sectionMissing;
  RowWriter writer(*sectionRows(), place());
  show(record, layout, rows, writer);
  if (countOf(record, primary) != 0) {
    primary_.show(record, primary, processRows, "Primary HARQ Process", *sectionRows(), place());
  }
  if (countOf(record, secondary) != 0) {
    secondary_.show(record, secondary, processRows, "Secondary HARQ Process", *sectionRows(), place());
  }
  return Outcome::shown;
}

}  // namespace kelvasi
