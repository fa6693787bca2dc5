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
    Row{.key = "Cell Access Restrictions", .field = indexIn(layout, "cell access restrictions")},
    Row{.key = "URA ID", .field = indexIn(layout, "URA identity")},
    Row{.key = uplinkKey, .field = indexIn(layout, "uplink UARFCN")},
    Row{.key = downlinkKey, .field = indexIn(layout, "downlink UARFCN")},
    Row{.key = cellKey, .field = indexIn(layout, "cell identity")},
    Row{.key = "Allowed Access", .field = indexIn(layout, "emergency calls only"), .texts = allowedAccess},
};
constexpr std::array records{
    RecordRows{utran::servingCell::logCode, utran::servingCell::minimumLength, layout, rows},
};

constexpr StateSection section{
    .name = "Serving Cell Info", .trace = "Serving Cell Info", .logCodes = logCodes, .records = records};

constexpr std::array cellRows{
    CellRow{"Local Area Code", kTelvonCellMonitorLAC, "Serving Cell Info: Failed to retrieve LAC\n"},
    CellRow{cellKey, kTelvonCellMonitorCellId, "Serving Cell Info: Failed to retrieve Cell ID\n"},
    CellRow{"Freq Band Indicator", kTelvonCellMonitorBandInfo,
            "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"},
    CellRow{"Cell Scrambling Code", kTelvonCellMonitorSCN,
            "Serving Cell Info: Failed to retrieve Cell Scrambling Code\n"},
    CellRow{uplinkKey, kTelvonCellMonitorUARFCN, "Serving Cell Info: Failed to retrieve UARFCN\n"},
    // The one number for both directions; its absence has been said.
    CellRow{downlinkKey, kTelvonCellMonitorUARFCN, {}},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyUTRAN2};
constexpr CellTable cells{
    .technologies = technologies, .type = kTelvonCellMonitorCellTypeServing, .rows = cellRows};

}  // namespace

UTRANServingCellInfo::UTRANServingCellInfo(const Platform& platform) : StateDecoder(platform, section) {}

// Every serving cell of the list is shown, so the last one wins. A code that it did not ask for is not worth
// a line.
void UTRANServingCellInfo::decodeOther(RecordView record, LogCode logCode) {
  if (logCode != cellInfoLogCode) return;
  const CellInfoArray cellInfo(platform(), record.payload());
  if (!cellInfo.cells()) return;
  PlistDictionary unbound;
  for (const PlistValue& cell : *cellInfo.cells()) {
    if (!cells.takes(cell)) continue;
    RowWriter writer(sectionRows() ? *sectionRows() : unbound);
    kelvasi::showCell(*cell.dictionary(), cellRows, writer, log());
  }
}

}  // namespace kelvasi
