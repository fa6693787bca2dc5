// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/NeighboringCells.h"

#include <algorithm>

#include "LogGenerator/GSM/BSICList.h"
#include "LogGenerator/GSM/GSMMeasurements.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

namespace {

using gsmMeasurements::neighbourLayout;

constexpr std::array logCodes{gsmMeasurements::logCode, bsicList::logCode, cellInfoLogCode};

constexpr std::array rows{
    Row{.key = "ARFCN", .quantity = quantity::arfcn, .field = indexIn(neighbourLayout, "ARFCN")},
    Row{.key = "RSSI", .quantity = quantity::rxlev, .field = indexIn(neighbourLayout, "RSSI")},
    Row{.key = "C1 Value", .quantity = quantity::c1, .field = indexIn(neighbourLayout, "C1")},
};

// The cell list's RSSI is shown doubled; the measured one above as it is, and without a unit.
constexpr std::array cellRows{
    CellRow{{.key = "ARFCN", .quantity = quantity::arfcn},
            kTelvonCellMonitorARFCN,
            "NeighboringCells: Failed to retrieve ARFCN\n"},
    CellRow{{.key = "RSSI",
             .quantity = quantity::rssi,
             .unit = " dBm",
             .special = emptyIfNotMeasured,
             .factor = 2},
            kTelvonCellMonitorRSSI,
            "NeighboringCells: Failed to retrieve RSSI\n"},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyGSM};
constexpr CellTable neighbours{
    technologies, kTelvonCellMonitorCellTypeNeighbor, cellRows, {RadioFamily::gsm, kTelvonCellMonitorARFCN}};

// From the record of the codes.
constexpr std::array codeRows{
    Row{.key = "BSIC", .quantity = quantity::bsic, .field = indexIn(bsicList::cellLayout, "BSIC")},
};
constexpr std::array others{
    RecordPart{.logCode = bsicList::logCode,
               .layout = bsicList::cellLayout,
               .rows = codeRows,
               .of = "entry",
               .minimumLength = bsicList::minimumLength,
               .entries = &bsicList::cells},
    RecordPart{.logCode = gsmMeasurements::logCode, .rows = codeRows, .of = "the last record 0x51FF"},
};

constexpr ListSection section{.name = "Neighboring Cells",
                              .trace = "NeighboringCells",
                              .logCodes = logCodes,
                              .logCode = gsmMeasurements::logCode,
                              .minimumLength = gsmMeasurements::minimumLength,
                              .list = gsmMeasurements::neighbours,
                              .rows = rows,
                              .cells = &neighbours,
                              .role = CellRole::neighbour,
                              .cell = {.family = RadioFamily::gsm},
                              .others = others};

}  // namespace

NeighboringCells::NeighboringCells(const Platform& platform) : ListDecoder(platform, section) {}

void NeighboringCells::addEntry(RecordView record, std::size_t place) {
  const RecordView neighbour = entry(record, place);
  RowWriter row = addRows();
  show(neighbour, neighbourLayout, rows, row);
  if (const auto bsic = bsicOf(valueOf(neighbour, fieldIn(neighbourLayout, "ARFCN"))))
    row.write(codeRows.front(), *bsic);
}

std::optional<std::int64_t> NeighboringCells::bsicOf(std::int64_t arfcn) const {
  const auto coded = std::find_if(arfcnToBsic_.rbegin(), arfcnToBsic_.rend(),
                                  [&](const CodedCell& cell) { return cell.arfcn == arfcn; });
  return coded == arfcnToBsic_.rend() ? std::nullopt : std::optional(coded->bsic);
}

CellIdentity NeighboringCells::cellOf(RecordView record, std::size_t place) const {
  const std::int64_t arfcn = valueOf(entry(record, place), fieldIn(neighbourLayout, "ARFCN"));
  return {RadioFamily::gsm, arfcn, bsicOf(arfcn).value_or(CellIdentity::unknown)};
}

Outcome NeighboringCells::decodeOther(RecordView record, LogCode logCode) {
  if (logCode != bsicList::logCode) return ListDecoder::decodeOther(record, logCode);
  if (record.size() < bsicList::minimumLength) return Outcome::tooShort;
  arfcnToBsic_.clear();
  for (std::size_t place = 0; place < countOf(record, bsicList::cells); ++place) {
    const RecordView cell = entryOf(record, bsicList::cells, place);
    arfcnToBsic_.push_back({valueOf(cell, fieldIn(bsicList::cellLayout, "ARFCN")),
                            valueOf(cell, fieldIn(bsicList::cellLayout, "BSIC"))});
  }
  return listOutcome();
}

}  // namespace kelvasi
