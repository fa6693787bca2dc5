#include "LogGenerator/GSM/EquivalentPLMNList.h"

#include "LogGenerator/GSM/EquivalentPLMN.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{equivalentPlmn::logCode};
constexpr ListSection section{.name = "Equivalent PLMN List",
                              .trace = "Equivalent PLMN List",
                              .logCodes = logCodes,
                              .logCode = equivalentPlmn::logCode,
                              .minimumLength = equivalentPlmn::minimumLength,
                              .list = equivalentPlmn::plmns};

std::int64_t decimal(RecordView entry, std::size_t firstDigit) {
  const auto digit = [&](std::size_t place) { return valueOf(entry, equivalentPlmn::entryLayout[place]); };
  return digit(firstDigit) * 100 + digit(firstDigit + 2) * 10 + digit(firstDigit + 4);
}

}  // namespace

EquivalentPLMNList::EquivalentPLMNList(const Platform& platform) : ListDecoder(platform, section) {}

void EquivalentPLMNList::addEntry(RecordView record, std::size_t place) {
  const RecordView plmn = entry(record, place);
  RowWriter row = addRows();
  row.number("Mobile Country Code", decimal(plmn, indexIn(equivalentPlmn::entryLayout, "MCC hundreds")));
  row.number("Mobile Network Code", decimal(plmn, indexIn(equivalentPlmn::entryLayout, "MNC hundreds")));
}

}  // namespace kelvasi
