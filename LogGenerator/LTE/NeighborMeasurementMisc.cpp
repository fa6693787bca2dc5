// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/NeighborMeasurementMisc.h"

#include "LogGenerator/LTE/NeighborMeasurement.h"

namespace kelvasi {

namespace {

using lte::neighborMeasurement::layout;

constexpr std::array logCodes{lte::neighborMeasurement::logCode};

constexpr std::array rows{
    Row{.key = "Version", .quantity = quantity::version, .field = indexIn(layout, "version")},
    Row{.key = "E-ARFCN", .quantity = quantity::earfcn, .field = indexIn(layout, "E-ARFCN")},
    Row{.key = "Qrxlevmin",
        .quantity = quantity::qrxlevmin,
        .field = indexIn(layout, "Qrxlevmin"),
        .unit = " dBm",
        .factor = 2,
        .offset = -140},
};
constexpr std::array records{
    RecordRows{lte::neighborMeasurement::logCode, lte::neighborMeasurement::minimumLength, layout, rows},
};

constexpr StateSection section{.name = "Neighbor Measurements",
                               .trace = "Neighbor Measurements",
                               .logCodes = logCodes,
                               .records = records,
                               .role = CellRole::neighbour};

}  // namespace

NeighborMeasurementMisc::NeighborMeasurementMisc(const Platform& platform)
    : StateDecoder(platform, section) {}

}  // namespace kelvasi
