#include "LogGenerator/UTRAN/GSMNeighbhorMeasurements.h"

#include "LogGenerator/UTRAN/GSMNeighborCells.h"

namespace kelvasi {

namespace {

using utran::gsmNeighborCells::cellLayout;

constexpr std::array logCodes{utran::gsmNeighborCells::logCode};

constexpr std::array rows{
    Row{.key = "Cell ID", .field = indexIn(cellLayout, "cell identity")},
    Row{.key = "Band Indicator", .field = indexIn(cellLayout, "band indicator")},
    Row{.key = "BSIC Valid", .field = indexIn(cellLayout, "BSIC valid")},
    Row{.key = "NCC", .field = indexIn(cellLayout, "NCC")},
    Row{.key = "BCC", .field = indexIn(cellLayout, "BCC")},
    Row{.key = "ARFCN", .field = indexIn(cellLayout, "ARFCN")},
    Row{.key = "RSSI", .field = indexIn(cellLayout, "RSSI")},
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
