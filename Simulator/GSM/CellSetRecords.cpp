// SPDX-License-Identifier: Apache-2.0
#include "Simulator/GSM/CellSetRecords.h"

#include <algorithm>
#include <cmath>

#include "LogGenerator/GSM/CellSets.h"
#include "LogGenerator/GSM/NeighbourSets.h"
#include "Simulator/EntryWriter.h"
#include "Simulator/Handset/CellSelection.h"
#include "Simulator/Radio/Reported.h"

namespace kelvasi::sim::gsm {

namespace {

using Places = std::vector<std::size_t>;

constexpr std::int64_t monitored = 1;           // set membership
constexpr double energyAtZeroDecibel = 524288;  // linear Ec/No
constexpr std::int64_t leastEnergy = 2241;      // of the -24 dB that end the scale
constexpr int rscpOffset = 21;                  // dB between the record's RSCP and the true one

int whole(double value) {
  return static_cast<int>(std::lround(value));
}

// Tenths of a dB over -106 dBm, less 512.
int receiveAgc(double dBm) {
  return whole((dBm + 106) * 10) - 512;
}

// Of the serving carrier.
Places followedCells(const World& world) {
  Places places = world.activeSet().cells();
  const std::uint16_t frequency = world.cell(*world.serving()).frequency;
  for (const std::size_t place : world.umtsNeighbours()) {
    if (world.cell(place).frequency == frequency && !world.activeSet().contains(place))
      places.push_back(place);
  }
  return places;
}

Places withServing(const World& world, const Places& neighbours) {
  Places places{*world.serving()};
  places.insert(places.end(), neighbours.begin(), neighbours.end());
  return places;
}

}  // namespace

std::optional<Bytes> cellSetsRecord(const World& world) {
  RecordWriter record(cellSets::logCode, cellSets::layout, cellSets::minimumLength);
  record.set("receive AGC", receiveAgc(world.carrierPower()));
  const Places places = world.isOn(Technology::umts) ? followedCells(world) : Places();
  writeEntries(record, cellSets::identities, places, [&](std::size_t place, RecordWriter& entry) {
    entry.set("scrambling code", world.cell(place).code)
        .set("set membership", world.activeSet().contains(place) ? cellSets::activeSetMember : monitored);
  });
  writeEntries(record, cellSets::energies, places, [&](std::size_t place, RecordWriter& entry) {
    const double energy = energyAtZeroDecibel * std::pow(10, reportedEcNo(world.reception(place)) / 10);
    entry.set("energy 1", std::max<std::int64_t>(std::llround(energy), leastEnergy));
  });
  return record.bytes();
}

std::optional<Bytes> rankedUmtsCellsRecord(const World& world) {
  if (world.isOn(Technology::gsm)) return std::nullopt;
  RecordWriter record(neighbourSets::logCode, neighbourSets::layout, neighbourSets::minimumLength);
  if (!world.serving()) return record.bytes();
  writeEntries(record, neighbourSets::umtsCells, withServing(world, world.umtsNeighbours()),
               [&](std::size_t place, RecordWriter& entry) {
                 const Reception& heard = world.reception(place);
                 entry.set("downlink UARFCN", world.cell(place).frequency)
                     .set("scrambling code", world.cell(place).code)
                     .set("RSCP", whole(reportedRscp(heard)) + rscpOffset)
                     .set("rank-cell RSCP", whole(reportedRscp(heard)))
                     .set("Ec/No in half dB", whole(reportedEcNo(heard) * 2))
                     .set("ranking value", whole(reportedEcNo(heard)));
               });
  return record.bytes();
}

std::optional<Bytes> rankedGsmCellsRecord(const World& world) {
  if (!world.isOn(Technology::gsm)) return std::nullopt;
  RecordWriter record(neighbourSets::logCode, neighbourSets::layout, neighbourSets::minimumLength);
  writeEntries(record, neighbourSets::gsmCells, withServing(world, world.gsmNeighbours()),
               [&](std::size_t place, RecordWriter& entry) {
                 const Reception& heard = world.reception(place);
                 entry.set("ARFCN", world.cell(place).frequency)
                     .set("BSIC", world.cell(place).code)
                     .set("RSSI", whole(reportedGsmLevel(heard)))
                     .set("ranking value", whole(criterionC2(heard)));
               });
  return record.bytes();
}

}  // namespace kelvasi::sim::gsm
