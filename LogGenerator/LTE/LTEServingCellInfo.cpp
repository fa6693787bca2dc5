#include "LogGenerator/LTE/LTEServingCellInfo.h"

#include "LogGenerator/Daemon/CellRows.h"
#include "LogGenerator/LTE/ServingCell.h"
#include "LogGenerator/LTE/TransmitAntennas.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

namespace {

using namespace lte;

constexpr std::string_view frequencyKey = "UARFCN";

constexpr std::array logCodes{servingCell::logCode, transmitAntennas::logCode, cellInfoLogCode};

constexpr std::array antennaRows{
    Row{.key = "Num Tx Antennas", .field = indexIn(transmitAntennas::layout, "transmit antennas")},
};
constexpr std::array servingCellRows{
    Row{.key = "Physical Cell ID", .field = indexIn(servingCell::layout, "physical cell identity")},
    Row{.key = "Download Frequency", .field = indexIn(servingCell::layout, "downlink E-ARFCN")},
    Row{.key = "Upload Frequency", .field = indexIn(servingCell::layout, "uplink E-ARFCN")},
    Row{.key = "Download Bandwidth",
        .field = indexIn(servingCell::layout, "downlink bandwidth"),
        .texts = servingCell::bandwidths},
    Row{.key = "Upload Bandwidth",
        .field = indexIn(servingCell::layout, "uplink bandwidth"),
        .texts = servingCell::bandwidths},
    Row{.key = "Cell Identity", .field = indexIn(servingCell::layout, "cell identity")},
    Row{.key = "Tracking Area Code", .field = indexIn(servingCell::layout, "tracking area code")},
    Row{.key = "Freq Band Indicator", .field = indexIn(servingCell::layout, "frequency band indicator")},
};
constexpr std::array records{
    RecordRows{servingCell::logCode, servingCell::minimumLength, servingCell::layout, servingCellRows},
    RecordRows{transmitAntennas::logCode, transmitAntennas::minimumLength, transmitAntennas::layout,
               antennaRows},
};

constexpr std::array cellRows{
    CellRow{"Tracking Area Code", kTelvonCellMonitorTAC, "Serving Cell Info: Failed to retrieve TAC\n"},
    CellRow{"Cell Identity", kTelvonCellMonitorCellId, "Serving Cell Info: Failed to retrieve Cell ID\n"},
    CellRow{"Physical Cell ID", kTelvonCellMonitorPID,
            "Serving Cell Info: Failed to retrieve Physical Cell ID\n"},
    CellRow{"Freq Band Indicator", kTelvonCellMonitorBandInfo,
            "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"},
    CellRow{frequencyKey, kTelvonCellMonitorUARFCN, "Serving Cell Info: Failed to retrieve UARFCN\n"},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyLTE};
constexpr CellTable cells{
    .technologies = technologies, .type = kTelvonCellMonitorCellTypeServing, .rows = cellRows};

constexpr StateSection section{.name = "Serving Cell Info",
                               .trace = "LTE Serving Cell Info",
                               .logCodes = logCodes,
                               .records = records,
                               .cells = &cells};

}  // namespace

LTEServingCellInfo::LTEServingCellInfo(const Platform& platform) : StateDecoder(platform, section) {}

void LTEServingCellInfo::updateWithData(RecordView record, LogCode logCode) {
  // The record has frequencies of its own in place of the cell list's.
  if (logCode == servingCell::logCode && record.size() >= servingCell::minimumLength && sectionRows())
    sectionRows()->remove(frequencyKey);
  StateDecoder::updateWithData(record, logCode);
  // Tools that count records by this line know the antenna record among the unknown ones.
  if (logCode == transmitAntennas::logCode && record.size() >= transmitAntennas::minimumLength)
    logUnknownMessage(logCode);
}

}  // namespace kelvasi
