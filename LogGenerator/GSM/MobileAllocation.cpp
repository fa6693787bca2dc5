// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/MobileAllocation.h"

#include <string>

#include "LogGenerator/GSM/HoppingList.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{hoppingList::logCode};
constexpr StateSection section{
    .name = "Mobile Allocation", .trace = "MobileAllocation", .logCodes = logCodes};

}  // namespace

MobileAllocation::MobileAllocation(const Platform& platform) : StateDecoder(platform, section) {}

Outcome MobileAllocation::decodeOther(RecordView record, LogCode logCode) {
  using namespace hoppingList;
  if (logCode != hoppingList::logCode) return StateDecoder::decodeOther(record, logCode);
  if (record.size() < minimumLength) return Outcome::tooShort;
  if (!sectionRows()) return Outcome::sectionMissing;
  RowWriter writer(*sectionRows(), place());
  show(record, layout, rows, writer);
  frequencies_.show(record, frequencies, frequencyRow, *sectionRows(), place());
  return Outcome::shown;
}

}  // namespace kelvasi
