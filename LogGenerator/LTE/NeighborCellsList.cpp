// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/NeighborCellsList.h"

#include "LogGenerator/LTE/MeasurementScales.h"
#include "LogGenerator/LTE/NeighborMeasurement.h"

namespace kelvasi {

namespace {

using namespace lte;
using neighborMeasurement::neighborLayout;

constexpr std::array logCodes{neighborMeasurement::logCode};

constexpr std::size_t identity = indexIn(neighborLayout, "physical cell identity");
constexpr std::size_t frameOffset = indexIn(neighborLayout, "frame offset");
constexpr std::size_t sampleOffset = indexIn(neighborLayout, "sample offset");

constexpr std::array rows{
    Row{.key = "Physical Cell ID", .quantity = quantity::pci, .field = identity},
    Row{.key = "Measured RSSI",
        .quantity = quantity::rssi,
        .field = indexIn(neighborLayout, "measured RSSI"),
        .unit = " dBm",
        .scale = halfRssi},
    Row{.key = "Measured RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(neighborLayout, "measured RSRP"),
        .unit = " dBm",
        .scale = halfRsrp},
    Row{.key = "Average RSRP",
        .quantity = quantity::rsrp,
        .field = indexIn(neighborLayout, "average RSRP"),
        .unit = " dBm",
        .scale = halfRsrp},
    Row{.key = "Measured RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(neighborLayout, "measured RSRQ"),
        .unit = " dB",
        .scale = quarterRsrq},
    Row{.key = "Average RSRQ",
        .quantity = quantity::rsrq,
        .field = indexIn(neighborLayout, "average RSRQ"),
        .unit = " dB",
        .scale = quarterRsrq},
    Row{.key = "Srxlev",
        .quantity = quantity::srxlev,
        .field = indexIn(neighborLayout, "Srxlev"),
        .unit = " dBm",
        .offset = -30},
    Row{.key = "Frequency Offset",
        .quantity = quantity::frequencyOffset,
        .field = indexIn(neighborLayout, "frequency offset")},
    Row{.key = "Ant 0 Frame Offset", .quantity = quantity::frameOffset, .field = frameOffset},
    Row{.key = "Ant 0 Sample Offset", .quantity = quantity::sampleOffset, .field = sampleOffset},
    // The record has the offsets of one antenna only; the second one shows them again.
    Row{.key = "Ant 1 Frame Offset", .quantity = quantity::frameOffset, .field = frameOffset},
    Row{.key = "Ant 1 Sample Offset", .quantity = quantity::sampleOffset, .field = sampleOffset},
};

constexpr ListSection section{.name = "Neighbor Cells List",
                              .trace = "Neighbor Cells List",
                              .logCodes = logCodes,
                              .logCode = neighborMeasurement::logCode,
                              .minimumLength = neighborMeasurement::minimumLength,
                              .list = neighborMeasurement::neighbors,
                              .rows = rows,
                              .role = CellRole::neighbour,
                              .cell = neighborMeasurement::neighborCell};

}  // namespace

NeighborCellsList::NeighborCellsList(const Platform& platform) : ListDecoder(platform, section) {}

void NeighborCellsList::addEntry(RecordView record, std::size_t place) {
  if (log().wants(LogPriority::warning)) traceEntry(record, place);
  ListDecoder::addEntry(record, place);
}

void NeighborCellsList::traceEntry(RecordView record, std::size_t place) const {
  if (place == 0) {
    log().print(LogPriority::warning, "Number of neighboring cells being reported: %d\n",
                static_cast<int>(countOf(record, section.list)));
  }
  const RecordView neighbor = entry(record, place);
  log().print(LogPriority::warning, "Physical Cell ID: %d\n",
              static_cast<int>(valueOf(neighbor, neighborLayout[identity])));
  // Every measurement goes by this one name.
  for (const Row& row : rows) {
    if (!row.scale) continue;
    const std::int64_t raw = valueOf(neighbor, neighborLayout[row.field]);
    log().print(LogPriority::warning, "Measured RSSI: %lf\n", row.scale->of(raw));
  }
}

}  // namespace kelvasi
