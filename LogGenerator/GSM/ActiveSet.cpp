// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/ActiveSet.h"

#include "LogGenerator/GSM/CellSets.h"

namespace kelvasi {

namespace {

using namespace cellSets;

constexpr std::array rows{
    Row{.key = "Scrambling Code",
        .quantity = quantity::scramblingCode,
        .field = indexIn(identityLayout, "scrambling code")},
};
constexpr std::array calculatedRows{
    Row{.key = "RSCP", .quantity = quantity::rscp, .unit = " dB"},
    Row{.key = "Energy Per Chip", .quantity = quantity::ecno, .unit = " dB"},
};
constexpr const Row& powerRow = calculatedRows[0];
constexpr const Row& energyRow = calculatedRows[1];
constexpr std::array others{
    RecordPart{.logCode = cellSets::logCode, .rows = calculatedRows},
    RecordPart{cellSets::logCode, layout},
    RecordPart{.logCode = cellSets::logCode, .layout = energyLayout, .of = "entry", .entries = &energies},
};

constexpr CellFields memberCell{.family = RadioFamily::umts,
                                .code = fieldIn(identityLayout, "scrambling code"),
                                .takesServingChannel = true};

constexpr ListSection section{.name = "Active Set",
                              .trace = "ActiveSet",
                              .logCodes = logCodes,
                              .logCode = cellSets::logCode,
                              .minimumLength = minimumLength,
                              .list = identities,
                              .rows = rows,
                              .role = CellRole::active,
                              .cell = memberCell,
                              .others = others};

// dBm, from steps of a tenth of a dB.
std::int64_t receivedPower(RecordView record) {
  return (valueOf(record, fieldIn(layout, "receive AGC")) + 512) / 10 - 106;
}

std::uint32_t energyOf(RecordView cell) {
  for (const Field& field : energyLayout) {
    if (const std::int64_t energy = valueOf(cell, field)) return static_cast<std::uint32_t>(energy);
  }
  return 0;
}

}  // namespace

ActiveSet::ActiveSet(const Platform& platform) : ListDecoder(platform, section) {}

void ActiveSet::addEntry(RecordView record, std::size_t place) {
  const RecordView identity = entry(record, place);
  if (valueOf(identity, fieldIn(identityLayout, "set membership")) != activeSetMember) return;
  const int ecno = lookUpECNO(energyOf(entryOf(record, energies, place)));
  RowWriter row = addRows();
  show(identity, identityLayout, rows, row);
  row.write(powerRow, receivedPower(record) + ecno);
  row.write(energyRow, ecno);
}

}  // namespace kelvasi
