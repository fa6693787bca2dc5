// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/UTRANServingCellInfo.h"

#include "LogGenerator/Daemon/CellRows.h"
#include "LogGenerator/UTRAN/ServingCell.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

namespace {

using utran::servingCell::layout;

constexpr std::string_view uplinkKey = "Uplink UARFCN";
constexpr std::string_view downlinkKey = "Downlink UARFCN";
constexpr std::string_view cellKey = "Cell ID";

constexpr std::array logCodes{utran::servingCell::logCode, cellInfoLogCode};

constexpr std::array<std::string_view, 2> allowedAccess{"All Calls", "Emergency Calls Only"};

constexpr std::array rows{
    Row{.key = "Cell Access Restrictions",
        .quantity = quantity::accessRestrictions,
        .field = indexIn(layout, "cell access restrictions")},
    Row{.key = "URA ID", .quantity = quantity::uraId, .field = indexIn(layout, "URA identity")},
    Row{.key = uplinkKey, .quantity = quantity::uarfcn, .field = indexIn(layout, "uplink UARFCN")},
    Row{.key = downlinkKey, .quantity = quantity::uarfcn, .field = indexIn(layout, "downlink UARFCN")},
    Row{.key = cellKey, .quantity = quantity::cellId, .field = indexIn(layout, "cell identity")},
    Row{.key = "Allowed Access",
        .quantity = quantity::access,
        .field = indexIn(layout, "emergency calls only"),
        .texts = allowedAccess},
};
constexpr std::array records{
    RecordRows{utran::servingCell::logCode, utran::servingCell::minimumLength, layout, rows,
               utran::servingCell::cell},
};

constexpr StateSection section{.name = "Serving Cell Info",
                               .trace = "Serving Cell Info",
                               .logCodes = logCodes,
                               .records = records,
                               .role = CellRole::serving};

constexpr std::array cellRows{
    CellRow{{.key = "Local Area Code", .quantity = quantity::lac},
            kTelvonCellMonitorLAC,
            "Serving Cell Info: Failed to retrieve LAC\n"},
    CellRow{{.key = cellKey, .quantity = quantity::cellId},
            kTelvonCellMonitorCellId,
            "Serving Cell Info: Failed to retrieve Cell ID\n"},
    CellRow{{.key = "Freq Band Indicator", .quantity = quantity::bandInfo},
            kTelvonCellMonitorBandInfo,
            "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"},
    CellRow{{.key = "Cell Scrambling Code", .quantity = quantity::cellParameter},
            kTelvonCellMonitorSCN,
            "Serving Cell Info: Failed to retrieve Cell Scrambling Code\n"},
    CellRow{{.key = uplinkKey, .quantity = quantity::uarfcn},
            kTelvonCellMonitorUARFCN,
            "Serving Cell Info: Failed to retrieve UARFCN\n"},
    // The one number for both directions; its absence has been said.
    CellRow{{.key = downlinkKey, .quantity = quantity::uarfcn}, kTelvonCellMonitorUARFCN, {}},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyUTRAN2};
constexpr CellTable cells{.technologies = technologies,
                          .type = kTelvonCellMonitorCellTypeServing,
                          .rows = cellRows,
                          .keys = {RadioFamily::utraTdd, kTelvonCellMonitorUARFCN, kTelvonCellMonitorSCN}};

}  // namespace

UTRANServingCellInfo::UTRANServingCellInfo(const Platform& platform) : StateDecoder(platform, section) {}

void UTRANServingCellInfo::describe(RowCatalog& catalog) const {
  StateDecoder::describe(catalog);
  cells.describe(getSectionName(), catalog);
}

// Every serving cell of the list is shown, so the last one wins. A code that it did not ask for is not worth
// a line.
Outcome UTRANServingCellInfo::decodeOther(RecordView record, LogCode logCode) {
  if (logCode != cellInfoLogCode) return Outcome::notAskedFor;
  const CellInfoArray cellInfo(platform(), record.payload());
  if (!cellInfo.cells()) return Outcome::propertyListRefused;
  PlistDictionary unbound;
  for (const PlistValue& cell : *cellInfo.cells()) {
    if (!cells.takes(cell)) continue;
    RowWriter writer(sectionRows() ? *sectionRows() : unbound, place());
    kelvasi::showCell(*cell.dictionary(), cells, writer, log());
  }
  return rowsOutcome();
}

}  // namespace kelvasi
