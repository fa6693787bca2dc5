// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/GSMNeighbhorMeasurements.h"

#include "LogGenerator/UTRAN/GSMNeighborCells.h"

namespace kelvasi {

namespace {

using utran::gsmNeighborCells::cellLayout;

constexpr std::array logCodes{utran::gsmNeighborCells::logCode};

constexpr std::array rows{
    Row{.key = "Cell ID", .quantity = quantity::cellId, .field = indexIn(cellLayout, "cell identity")},
    Row{.key = "Band Indicator", .quantity = quantity::band, .field = indexIn(cellLayout, "band indicator")},
    Row{.key = "BSIC Valid", .quantity = quantity::flag, .field = indexIn(cellLayout, "BSIC valid")},
    Row{.key = "NCC", .quantity = quantity::ncc, .field = indexIn(cellLayout, "NCC")},
    Row{.key = "BCC", .quantity = quantity::bcc, .field = indexIn(cellLayout, "BCC")},
    Row{.key = "ARFCN", .quantity = quantity::arfcn, .field = indexIn(cellLayout, "ARFCN")},
    Row{.key = "RSSI", .quantity = quantity::rssi, .field = indexIn(cellLayout, "RSSI")},
};

constexpr ListSection section{.name = "GSM Neighbor Cell List",
                              .trace = "GSM Neighbor Cell List",
                              .logCodes = logCodes,
                              .logCode = utran::gsmNeighborCells::logCode,
                              .minimumLength = utran::gsmNeighborCells::minimumLength,
                              .list = utran::gsmNeighborCells::cells,
                              .rows = rows,
                              .staysEmpty = true};

}  // namespace

GSMNeighbhorMeasurements::GSMNeighbhorMeasurements(const Platform& platform)
    : ListDecoder(platform, section) {}

}  // namespace kelvasi
