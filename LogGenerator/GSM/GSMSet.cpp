#include "LogGenerator/GSM/GSMSet.h"

#include "LogGenerator/GSM/NeighbourSets.h"

namespace kelvasi {

namespace {

using namespace neighbourSets;

constexpr std::array logCodes{neighbourSets::logCode};
constexpr std::array rows{
    Row{.key = "ARFCN", .field = indexIn(gsmLayout, "ARFCN")},
    Row{.key = "BSIC", .field = indexIn(gsmLayout, "BSIC")},
    Row{.key = "RSSI", .field = indexIn(gsmLayout, "RSSI"), .unit = " dBm"},
    Row{.key = "Ranking Value", .field = indexIn(gsmLayout, "ranking value")},
};
constexpr ListSection section{.name = "GSM Set",
                              .trace = "GSMSet",
                              .logCodes = logCodes,
                              .logCode = neighbourSets::logCode,
                              .minimumLength = minimumLength,
                              .list = gsmCells,
                              .rows = rows};

}  // namespace

GSMSet::GSMSet(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
