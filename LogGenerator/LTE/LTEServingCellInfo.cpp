// SPDX-License-Identifier: Apache-2.0
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
    Row{.key = "Num Tx Antennas",
        .quantity = quantity::antennas,
        .field = indexIn(transmitAntennas::layout, "transmit antennas")},
};
constexpr std::array servingCellRows{
    Row{.key = "Physical Cell ID",
        .quantity = quantity::pci,
        .field = indexIn(servingCell::layout, "physical cell identity")},
    Row{.key = "Download Frequency",
        .quantity = quantity::earfcn,
        .field = indexIn(servingCell::layout, "downlink E-ARFCN")},
    Row{.key = "Upload Frequency",
        .quantity = quantity::earfcn,
        .field = indexIn(servingCell::layout, "uplink E-ARFCN")},
    Row{.key = "Download Bandwidth",
        .quantity = quantity::bandwidth,
        .field = indexIn(servingCell::layout, "downlink bandwidth"),
        .texts = servingCell::bandwidths},
    Row{.key = "Upload Bandwidth",
        .quantity = quantity::bandwidth,
        .field = indexIn(servingCell::layout, "uplink bandwidth"),
        .texts = servingCell::bandwidths},
    Row{.key = "Cell Identity",
        .quantity = quantity::cellId,
        .field = indexIn(servingCell::layout, "cell identity")},
    Row{.key = "Tracking Area Code",
        .quantity = quantity::tac,
        .field = indexIn(servingCell::layout, "tracking area code")},
    Row{.key = "Freq Band Indicator",
        .quantity = quantity::eutraBand,
        .field = indexIn(servingCell::layout, "frequency band indicator")},
};
constexpr std::array records{
    RecordRows{servingCell::logCode, servingCell::minimumLength, servingCell::layout, servingCellRows,
               servingCell::cell},
    RecordRows{transmitAntennas::logCode, transmitAntennas::minimumLength, transmitAntennas::layout,
               antennaRows, CellFields{.family = RadioFamily::lte, .isServing = true}},
};

constexpr std::array cellRows{
    CellRow{{.key = "Tracking Area Code", .quantity = quantity::tac},
            kTelvonCellMonitorTAC,
            "Serving Cell Info: Failed to retrieve TAC\n"},
    CellRow{{.key = "Cell Identity", .quantity = quantity::cellId},
            kTelvonCellMonitorCellId,
            "Serving Cell Info: Failed to retrieve Cell ID\n"},
    CellRow{{.key = "Physical Cell ID", .quantity = quantity::pci},
            kTelvonCellMonitorPID,
            "Serving Cell Info: Failed to retrieve Physical Cell ID\n"},
    CellRow{{.key = "Freq Band Indicator", .quantity = quantity::eutraBand},
            kTelvonCellMonitorBandInfo,
            "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"},
    CellRow{{.key = frequencyKey, .quantity = quantity::earfcn},
            kTelvonCellMonitorUARFCN,
            "Serving Cell Info: Failed to retrieve UARFCN\n"},
};
constexpr std::array technologies{kTelvonCellMonitorRadioAccessTechnologyLTE};
constexpr CellTable cells{.technologies = technologies,
                          .type = kTelvonCellMonitorCellTypeServing,
                          .rows = cellRows,
                          .keys = {RadioFamily::lte, kTelvonCellMonitorUARFCN, kTelvonCellMonitorPID}};

constexpr StateSection section{.name = "Serving Cell Info",
                               .trace = "LTE Serving Cell Info",
                               .logCodes = logCodes,
                               .records = records,
                               .cells = &cells,
                               .role = CellRole::serving};

}  // namespace

LTEServingCellInfo::LTEServingCellInfo(const Platform& platform) : StateDecoder(platform, section) {}

Outcome LTEServingCellInfo::updateWithData(RecordView record, LogCode logCode) {
  // The record has frequencies of its own in place of the cell list's.
  if (logCode == servingCell::logCode && record.size() >= servingCell::minimumLength && sectionRows())
    RowWriter(*sectionRows(), place()).remove(frequencyKey);
  const Outcome outcome = StateDecoder::updateWithData(record, logCode);
  // Tools that count records by this line know the antenna record among the unknown ones.
  if (logCode == transmitAntennas::logCode && record.size() >= transmitAntennas::minimumLength)
    logUnknownMessage(logCode);
  return outcome;
}

}  // namespace kelvasi
