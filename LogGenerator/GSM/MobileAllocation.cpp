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

void MobileAllocation::decodeOther(RecordView record, LogCode logCode) {
  using namespace hoppingList;
  if (logCode != hoppingList::logCode) return logUnknownMessage(logCode);
  if (record.size() < minimumLength || !sectionRows()) return;
  RowWriter writer(*sectionRows());
  show(record, layout, rows, writer);
  frequencies_.removeAll();
  for (std::size_t place = 0; place < countOf(record, frequencies); ++place) {
    const RecordView frequency = entryOf(record, frequencies, place);
    frequencies_.append(std::to_string(valueOf(frequency, fieldIn(frequencyLayout, "ARFCN"))));
  }
  shown_.show(frequencies_, "ARFCNs", *sectionRows());
}

}  // namespace kelvasi
