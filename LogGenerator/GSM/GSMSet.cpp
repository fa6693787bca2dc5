// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMSet.h"

#include "LogGenerator/GSM/NeighbourSets.h"

namespace kelvasi {

namespace {

using namespace neighbourSets;

constexpr std::array logCodes{neighbourSets::logCode};
constexpr std::array rows{
    Row{.key = "ARFCN", .quantity = quantity::arfcn, .field = indexIn(gsmLayout, "ARFCN")},
    Row{.key = "BSIC", .quantity = quantity::bsic, .field = indexIn(gsmLayout, "BSIC")},
    Row{.key = "RSSI", .quantity = quantity::rssi, .field = indexIn(gsmLayout, "RSSI"), .unit = " dBm"},
    Row{.key = "Ranking Value", .quantity = quantity::ranking, .field = indexIn(gsmLayout, "ranking value")},
};
constexpr ListSection section{.name = "GSM Set",
                              .trace = "GSMSet",
                              .logCodes = logCodes,
                              .logCode = neighbourSets::logCode,
                              .minimumLength = minimumLength,
                              .list = gsmCells,
                              .rows = rows,
                              .role = CellRole::neighbour,
                              .cell = gsmCell};

}  // namespace

GSMSet::GSMSet(const Platform& platform) : ListDecoder(platform, section) {}

}  // namespace kelvasi
