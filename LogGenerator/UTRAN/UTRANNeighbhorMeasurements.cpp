// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/UTRANNeighbhorMeasurements.h"

#include "LogGenerator/UTRAN/NeighborCells.h"

namespace kelvasi {

namespace {

using utran::neighborCells::cellLayout;

constexpr std::array logCodes{utran::neighborCells::logCode};

constexpr std::size_t membership = indexIn(cellLayout, "set membership");
constexpr std::array<std::string_view, 3> sets{"ASET", "MSET", "DSET"};
constexpr std::array<std::string_view, 2> truth{"FALSE", "TRUE"};
constexpr Scale rscp{.factor = 0.00390625, .format = "%f"};

constexpr std::array rows{
    Row{.key = "UARFCN", .quantity = quantity::uarfcn, .field = indexIn(cellLayout, "UARFCN")},
    Row{.key = "Cell ID", .quantity = quantity::cellParameter, .field = indexIn(cellLayout, "cell identity")},
    Row{.key = "Filter RSCP",
        .quantity = quantity::rscpLevel,
        .field = indexIn(cellLayout, "filtered RSCP"),
        .scale = rscp},
};
constexpr std::array membershipRows{
    Row{.key = "Status", .quantity = quantity::cellSet, .field = membership, .texts = sets}};
constexpr std::array lastRows{
    Row{.key = "inJDCS",
        .quantity = quantity::flag,
        .field = indexIn(cellLayout, "in the JDCS"),
        .texts = truth},
};

constexpr std::array others{
    RecordPart{utran::neighborCells::logCode, cellLayout, membershipRows, "entry"},
    RecordPart{utran::neighborCells::logCode, cellLayout, lastRows, "entry"},
};

constexpr ListSection section{.name = "Neighbor Cell List",
                              .trace = "NeighbhorMeasurements List",
                              .logCodes = logCodes,
                              .logCode = utran::neighborCells::logCode,
                              .minimumLength = utran::neighborCells::minimumLength,
                              .list = utran::neighborCells::cells,
                              .rows = rows,
                              .role = CellRole::neighbour,
                              .cell = utran::neighborCells::cell,
                              .isSilent = true,
                              .others = others};

}  // namespace

UTRANNeighbhorMeasurements::UTRANNeighbhorMeasurements(const Platform& platform)
    : ListDecoder(platform, section) {}

// A cell in none of the sets has no row that says so.
void UTRANNeighbhorMeasurements::addEntry(RecordView record, std::size_t place) {
  const RecordView cell = entry(record, place);
  const bool isInSet = static_cast<std::size_t>(valueOf(cell, cellLayout[membership])) < sets.size();
  RowWriter row = addRows();
  show(cell, cellLayout, rows, row);
  if (isInSet) show(cell, cellLayout, membershipRows, row);
  show(cell, cellLayout, lastRows, row);
}

}  // namespace kelvasi
