// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/EquivalentPLMNList.h"

#include "LogGenerator/GSM/EquivalentPLMN.h"

namespace kelvasi {

namespace {

constexpr std::array logCodes{equivalentPlmn::logCode};
// Each begins with its first digit's field.
constexpr std::array rows{
    Row{.key = "Mobile Country Code",
        .quantity = quantity::mcc,
        .field = indexIn(equivalentPlmn::entryLayout, "MCC hundreds")},
    Row{.key = "Mobile Network Code",
        .quantity = quantity::mnc,
        .field = indexIn(equivalentPlmn::entryLayout, "MNC hundreds")},
};

constexpr std::array parts{RecordPart{.logCode = equivalentPlmn::logCode,
                                      .layout = equivalentPlmn::entryLayout,
                                      .rows = rows,
                                      .of = "entry",
                                      .digits = 3}};

constexpr ListSection section{.name = "Equivalent PLMN List",
                              .trace = "Equivalent PLMN List",
                              .logCodes = logCodes,
                              .logCode = equivalentPlmn::logCode,
                              .minimumLength = equivalentPlmn::minimumLength,
                              .list = equivalentPlmn::plmns,
                              .others = parts};

std::int64_t decimal(RecordView entry, std::size_t firstDigit) {
  const auto digit = [&](std::size_t place) { return valueOf(entry, equivalentPlmn::entryLayout[place]); };
  return digit(firstDigit) * 100 + digit(firstDigit + 2) * 10 + digit(firstDigit + 4);
}

}  // namespace

EquivalentPLMNList::EquivalentPLMNList(const Platform& platform) : ListDecoder(platform, section) {}

void EquivalentPLMNList::addEntry(RecordView record, std::size_t place) {
  const RecordView plmn = entry(record, place);
  RowWriter row = addRows();
  for (const Row& each : rows) row.write(each, decimal(plmn, each.field));
}

}  // namespace kelvasi
