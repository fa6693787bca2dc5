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
    Row{.key = "ARFCN", .field = indexIn(neighbourLayout, "ARFCN")},
    Row{.key = "RSSI", .field = indexIn(neighbourLayout, "RSSI")},
    Row{.key = "C1 Value", .field = indexIn(neighbourLayout, "C1")},
};

// The cell list's RSSI is shown doubled; the measured one above as it is, and without a unit.
constexpr std::array cellRows{
    CellRow{"ARFCN", kTelvonCellMonitorARFCN, "NeighboringCells: Failed to retrieve ARFCN\n"},
    CellRow{.key = "RSSI",
            .cellKey = kTelvonCellMonitorRSSI,
            .failure = "NeighboringCells: Failed to retrieve RSSI\n",
            .unit = " dBm",
            .isMeasurement = true,
            .factor = 2},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyGSM};
constexpr CellTable neighbours{technologies, kTelvonCellMonitorCellTypeNeighbor, cellRows};

constexpr ListSection section{.name = "Neighboring Cells",
                              .trace = "NeighboringCells",
                              .logCodes = logCodes,
                              .logCode = gsmMeasurements::logCode,
                              .minimumLength = gsmMeasurements::minimumLength,
                              .list = gsmMeasurements::neighbours,
                              .rows = rows,
                              .cells = &neighbours};

}  // namespace

NeighboringCells::NeighboringCells(const Platform& platform) : ListDecoder(platform, section) {}

void NeighboringCells::addEntry(RecordView record, std::size_t place) {
  const RecordView neighbour = entry(record, place);
  RowWriter row = addRows();
  show(neighbour, neighbourLayout, rows, row);
  const std::int64_t arfcn = valueOf(neighbour, fieldIn(neighbourLayout, "ARFCN"));
  const auto coded = std::find_if(arfcnToBsic_.rbegin(), arfcnToBsic_.rend(),
                                  [&](const CodedCell& cell) { return cell.arfcn == arfcn; });
  if (coded != arfcnToBsic_.rend()) row.number("BSIC", coded->bsic);
}

void NeighboringCells::decodeOther(RecordView record, LogCode logCode) {
  if (logCode != bsicList::logCode) return logUnknownMessage(logCode);
  if (record.size() < bsicList::minimumLength) return;
  arfcnToBsic_.clear();
  for (std::size_t place = 0; place < countOf(record, bsicList::cells); ++place) {
    const RecordView cell = entryOf(record, bsicList::cells, place);
    arfcnToBsic_.push_back({valueOf(cell, fieldIn(bsicList::cellLayout, "ARFCN")),
                            valueOf(cell, fieldIn(bsicList::cellLayout, "BSIC"))});
  }
}

}  // namespace kelvasi
