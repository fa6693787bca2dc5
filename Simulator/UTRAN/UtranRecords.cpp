// SPDX-License-Identifier: Apache-2.0
#include "Simulator/UTRAN/UtranRecords.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "LogGenerator/UTRAN/ChannelMeasurement.h"
#include "LogGenerator/UTRAN/GSMNeighborCells.h"
#include "LogGenerator/UTRAN/NeighborCells.h"
#include "LogGenerator/UTRAN/RRCState.h"
#include "LogGenerator/UTRAN/ServingCell.h"
#include "Simulator/EntryWriter.h"
#include "Simulator/Radio/Reported.h"

namespace kelvasi::sim::utran {

namespace {

using namespace kelvasi::utran;

constexpr double monitoredMetres = 1200;  // between the sites
constexpr double jointWindow = 6;         // dB

constexpr int leastRscp = -116;  // dBm, level 0 of 3GPP TS 25.123, 9.1.1.1
constexpr int mostRscpLevel = 91;

constexpr double spreadingGain = 18;  // dB
constexpr std::array<double, channelMeasurement::timeslots> ripple{0.4, -0.3, 0.1, -0.5, 0.6, -0.2};
constexpr double leastRatio = -11;  // dB, level 0 of 3GPP TS 25.123, 9.1.1.5, in steps of half a dB
constexpr int mostRatioLevel = 63;

constexpr double leastBlockErrorLog = -4.03;  // 3GPP TS 25.123, 9.1.1.4
constexpr double blockErrorStep = 0.065;
constexpr int mostBlockErrorLevel = 63;

constexpr std::uint8_t dedicatedComposite = 1;
constexpr std::uint8_t commonComposite = 2;
constexpr std::uint8_t timeslot = 4;

constexpr unsigned cellIdentityBits = 14;

int whole(double value) {
  return static_cast<int>(std::lround(value));
}

int ratioLevel(double ratio) {
  return std::clamp(whole((ratio - leastRatio) * 2), 0, mostRatioLevel);
}

// One composite channel carries all transport channels of a connection.
std::vector<std::uint8_t> compositeChannels(const World& world) {
  if (world.traffic().channels().empty()) return {};
  const bool isDedicated = world.connection().rrc() == gsm::RadioConnection::Rrc::dch;
  return {isDedicated ? dedicatedComposite : commonComposite};
}

}  // namespace

int blockErrorLevel(double rate) {
  if (rate <= 0) return 0;
  const double steps = (std::log10(rate) - leastBlockErrorLog) / blockErrorStep;
  return std::clamp(1 + static_cast<int>(std::floor(steps)), 0, mostBlockErrorLevel);
}

double interferenceRatio(const World& world, std::size_t slot) {
  return world.reception(*world.serving()).ecNo + spreadingGain + ripple[slot];
}

Membership membershipOf(const World& world, std::size_t neighbour) {
  const double metres = distance(world.cell(neighbour).site, world.cell(*world.serving()).site);
  return metres < monitoredMetres ? Membership::monitored : Membership::detected;
}

bool isDetectedJointly(const World& world, std::size_t neighbour) {
  const std::size_t serving = *world.serving();
  return world.cell(neighbour).frequency == world.cell(serving).frequency &&
         world.reception(neighbour).level > world.reception(serving).level - jointWindow;
}

std::optional<Bytes> rrcStateRecord(const World& world) {
  return RecordWriter(rrcState::logCode, rrcState::layout, rrcState::expectedLength)
      .set("layout version", rrcState::knownVersion)
      .set("mode", static_cast<std::uint8_t>(world.connection().rrc()))
      .bytes();
}

std::optional<Bytes> servingCellRecord(const World& world) {
  if (!world.isOn(Technology::umts)) return std::nullopt;
  const Cell& cell = world.cell(*world.serving());
  return RecordWriter(servingCell::logCode, servingCell::layout, servingCell::minimumLength)
      .set("cell access restrictions", 0)
      .set("URA identity", cell.routingArea)
      .set("uplink UARFCN", cell.frequency)
      .set("downlink UARFCN", cell.frequency)
      .set("cell identity", cell.id)
      .set("emergency calls only", cell.isForbidden ? 1 : 0)
      .bytes();
}

std::optional<Bytes> neighborCellsRecord(const World& world) {
  RecordWriter record(neighborCells::logCode, neighborCells::layout, neighborCells::minimumLength);
  writeEntries(record, neighborCells::cells, world.umtsNeighbours(),
               [&](std::size_t place, RecordWriter& entry) {
                 const int level = whole(world.reception(place).level) - leastRscp;
                 entry.set("UARFCN", world.cell(place).frequency)
                     .set("cell identity", world.cell(place).code)
                     .set("filtered RSCP", std::clamp(level, 0, mostRscpLevel))
                     .set("set membership", static_cast<std::uint8_t>(membershipOf(world, place)))
                     .set("in the JDCS", isDetectedJointly(world, place) ? 1 : 0);
               });
  return record.bytes();
}

std::optional<Bytes> gsmNeighborCellsRecord(const World& world) {
  RecordWriter record(gsmNeighborCells::logCode, gsmNeighborCells::layout, gsmNeighborCells::minimumLength);
  writeEntries(record, gsmNeighborCells::cells, world.gsmNeighbours(),
               [&](std::size_t place, RecordWriter& entry) {
                 const Cell& cell = world.cell(place);
                 entry.set("cell identity", cell.id % (1U << cellIdentityBits))
                     .set("BSIC valid", 1)
                     .set("NCC", cell.code / 8)
                     .set("BCC", cell.code % 8)
                     .set("ARFCN", cell.frequency)
                     .set("RSSI", whole(reportedGsmLevel(world.reception(place))));
               });
  return record.bytes();
}

std::optional<Bytes> channelMeasurementRecord(const World& world) {
  RecordWriter record(channelMeasurement::logCode, channelMeasurement::layout,
                      channelMeasurement::minimumLength);
  writeEntries(record, channelMeasurement::transportChannels, world.traffic().channels(),
               [](const gsm::TransportChannel& channel, RecordWriter& entry) {
                 const double rate =
                     channel.received == 0 ? 0 : double{1} * channel.inError / channel.received;
                 entry.set("TRCH identity", channel.id).set("BLER measurement", blockErrorLevel(rate));
               });
  const std::vector<std::uint8_t> composites = compositeChannels(world);
  if (composites.empty()) return record.bytes();
  writeEntries(
      record, channelMeasurement::compositeChannels, composites, [&](std::uint8_t id, RecordWriter& entry) {
        entry.set("CCTRCH identity", id).set("timeslot number", timeslot);
        for (std::size_t slot = 0; slot < channelMeasurement::timeslots; ++slot)
          entry.set(channelMeasurement::ratioLayout[slot].name, ratioLevel(interferenceRatio(world, slot)));
      });
  return record.bytes();
}

}  // namespace kelvasi::sim::utran
