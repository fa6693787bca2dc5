// SPDX-License-Identifier: Apache-2.0
#include "Simulator/LTE/LteRecords.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "LogGenerator/LTE/ConnectedModeMeasurement.h"
#include "LogGenerator/LTE/MeasurementScales.h"
#include "LogGenerator/LTE/NeighborMeasurement.h"
#include "LogGenerator/LTE/ReselectionCandidates.h"
#include "LogGenerator/LTE/ServingCell.h"
#include "LogGenerator/LTE/ServingCellMeasurement.h"
#include "LogGenerator/LTE/TransmitAntennas.h"
#include "Radio/Channels.h"
#include "Simulator/EntryWriter.h"
#include "Simulator/Radio/Reported.h"

namespace kelvasi::sim::lte {

namespace {

using namespace kelvasi::lte;
namespace measurement = servingCellMeasurement;
namespace neighbour = neighborMeasurement;
namespace connected = connectedModeMeasurement;
namespace candidates = reselectionCandidates;

constexpr std::uint8_t measurementVersion = 4;
constexpr std::uint8_t neighbourVersion = 4;
constexpr std::uint8_t candidatesVersion = 1;

constexpr int powerOffset = 30;       // dB, of powers and of Srxlev
constexpr int leastQrxlevmin = -140;  // dBm
constexpr double framesPerSecond = 100;
constexpr std::int64_t subframesPerFrame = 10;
constexpr int frameNumbers = 1024;
constexpr std::uint32_t samplesPerFrame = 307200;  // at 30.72 MHz
constexpr double samplesPerMetre = 30.72e6 / 299792458;

// Numbers of the record's RAT types.
enum class Rat : std::uint8_t { lte, utran, geran };
constexpr std::uint8_t band900 = 0;

int whole(double value) {
  return static_cast<int>(std::lround(value));
}

// The nearest raw value of a scale, in so many bits.
std::int64_t raw(double value, const Scale& scale, unsigned width) {
  const std::int64_t most = (std::int64_t{1} << width) - 1;
  return std::clamp<std::int64_t>(std::llround((value - scale.offset) / scale.factor), 0, most);
}

std::int64_t srxlevRaw(const World& world, std::size_t place) {
  return std::clamp(whole(world.srxlev(place)) + powerOffset, 0, 127);
}

std::int64_t qrxlevminRaw(const Cell& cell) {
  return (layerOf(cell).leastLevel - leastQrxlevmin) / 2;
}

// Each cell's frames begin at a time of its own.
std::int64_t sampleOffset(const World& world, const Cell& cell) {
  const double way = distance(cell.site, world.position()) * samplesPerMetre;
  return (cell.code * 7919U + static_cast<std::uint32_t>(way)) % samplesPerFrame;
}

// Hz, as the two's complement in the field's 16 bits: up towards the site, down away from it.
std::int64_t dopplerShift(const World& world, const Cell& cell) {
  const double shift = world.speedTowards(cell.site) * cell.megahertz * 1e6 / 299792458;
  return static_cast<std::uint16_t>(static_cast<std::int16_t>(std::lround(shift)));
}

void encodeNeighbour(const World& world, std::size_t place, RecordWriter& entry) {
  const Cell& cell = world.cell(place);
  const Reception& now = world.reception(place);
  const Reception& average = world.average(place);
  entry.set("physical cell identity", cell.code)
      .set("measured RSSI", raw(world.rssi(place), halfRssi, 8))
      .set("measured RSRP", raw(reportedRsrp(now), halfRsrp, 9))
      .set("average RSRP", raw(reportedRsrp(average), halfRsrp, 9))
      .set("measured RSRQ", raw(reportedRsrq(now), quarterRsrq, 7))
      .set("average RSRQ", raw(reportedRsrq(average), quarterRsrq, 7))
      .set("Srxlev", srxlevRaw(world, place))
      .set("frequency offset", dopplerShift(world, cell))
      .set("frame offset", cell.code * 37 % frameNumbers)
      .set("sample offset", sampleOffset(world, cell));
}

Bytes ratSpecific(const Cell& cell) {
  if (cell.technology == Technology::lte)
    return RecordWriter(candidates::lteLayout)
        .set("E-ARFCN", cell.frequency)
        .set("cell identity", cell.code)
        .bytes();
  if (cell.technology == Technology::umts)
    return RecordWriter(candidates::utranLayout)
        .set("UARFCN", cell.frequency)
        .set("primary scrambling code", cell.code)
        .bytes();
  return RecordWriter(candidates::geranLayout)
      .set("ARFCN", cell.frequency)
      .set("band", band900)
      .set("BSIC", cell.code)
      .bytes();
}

Rat ratOf(const Cell& cell) {
  if (cell.technology == Technology::lte) return Rat::lte;
  return cell.technology == Technology::umts ? Rat::utran : Rat::geran;
}

bool isIdle(const World& world) {
  return world.isOnLte() && !world.isConnected();
}

MeasuredCell measured(const World& world, std::size_t place) {
  return measuredCell(world.cell(place), world.average(place));
}

}  // namespace

std::optional<Bytes> servingCellRecord(const World& world) {
  if (!world.isOnLte()) return std::nullopt;
  const Cell& cell = world.cell(*world.serving());
  const std::uint8_t blocks = layerOf(cell).resourceBlocks;
  return RecordWriter(servingCell::logCode, servingCell::layout, servingCell::minimumLength)
      .set("physical cell identity", cell.code)
      .set("downlink E-ARFCN", cell.frequency)
      .set("uplink E-ARFCN", *eutraUplinkNumber(cell.frequency))
      .set("downlink bandwidth", blocks)
      .set("uplink bandwidth", blocks)
      .set("cell identity", cell.id)
      .set("tracking area code", cell.locationArea.code)
      .set("frequency band indicator", eutraCarriers(cell.frequency)[0].band.number)
      .padTo(servingCell::minimumLength)
      .bytes();
}

std::optional<Bytes> transmitAntennasRecord(const World& world) {
  if (!world.isOnLte()) return std::nullopt;
  return RecordWriter(transmitAntennas::logCode, transmitAntennas::layout, transmitAntennas::minimumLength)
      .set("transmit antennas", layerOf(world.cell(*world.serving())).antennas)
      .bytes();
}

std::optional<Bytes> servingCellMeasurementRecord(const World& world) {
  if (!isIdle(world)) return std::nullopt;
  const std::size_t place = *world.serving();
  const Cell& cell = world.cell(place);
  const Reception& now = world.reception(place);
  const Reception& average = world.average(place);
  return RecordWriter(measurement::logCode, measurement::layout, measurement::minimumLength)
      .set("version", measurementVersion)
      .set("E-ARFCN", cell.frequency)
      .set("physical cell identity", cell.code)
      .set("serving layer priority", layerOf(cell).priority)
      .set("measured RSRP", raw(reportedRsrp(now), quarterRsrp, 9))
      .set("average RSRP", raw(reportedRsrp(average), quarterRsrp, 9))
      .set("measured RSRQ", raw(reportedRsrq(now), quarterRsrq, 7))
      .set("average RSRQ", raw(reportedRsrq(average), quarterRsrq, 7))
      .set("measured RSSI", raw(world.rssi(place), halfRssi, 9))
      .set("Qrxlevmin", qrxlevminRaw(cell))
      .set("P-Max", mostTransmitPower + powerOffset)
      .set("maximum UE transmit power", mostTransmitPower + powerOffset)
      .set("Srxlev", srxlevRaw(world, place))
      .set("DRX cycles with S below 0", world.drxCyclesBelow())
      .set("S-IntraSearch", intraSearch / 2)
      .set("S-NonIntraSearch", nonIntraSearch / 2)
      .set("measurement rules updated", world.hasNewMeasurementRules() ? 1 : 0)
      .set("measurement rules", world.measurementRules())
      .bytes();
}

std::optional<Bytes> neighborMeasurementRecord(const World& world) {
  if (!isIdle(world)) return std::nullopt;
  const Cell& cell = world.cell(*world.serving());
  RecordWriter record(neighbour::logCode, neighbour::layout, neighbour::minimumLength);
  record.set("version", neighbourVersion).set("E-ARFCN", cell.frequency).set("Qrxlevmin", qrxlevminRaw(cell));
  writeEntries(record, neighbour::neighbors, world.neighbours(),
               [&](std::size_t place, RecordWriter& entry) { encodeNeighbour(world, place, entry); });
  return record.bytes();
}

std::optional<Bytes> reselectionCandidatesRecord(const World& world) {
  if (!isIdle(world)) return std::nullopt;
  const Cell& cell = world.cell(*world.serving());
  RecordWriter record(candidates::logCode, candidates::layout, candidates::minimumLength);
  record.set("version", candidatesVersion)
      .set("serving E-ARFCN", cell.frequency)
      .set("serving cell identity", cell.code)
      .set("candidates", world.candidate() ? 1 : 0);
  if (!world.candidate()) return record.bytes();
  const Cell& candidate = world.cell(*world.candidate());
  return record
      .append(RecordWriter(candidates::candidateLayout)
                  .set("priority", layerOf(candidate).priority)
                  .set("RAT type", static_cast<std::uint8_t>(ratOf(candidate)))
                  .bytes())
      .append(ratSpecific(candidate))
      .bytes();
}

std::optional<Bytes> connectedModeMeasurementRecord(const World& world) {
  if (!world.isConnected()) return std::nullopt;
  const std::size_t place = *world.serving();
  const auto subframe = static_cast<std::int64_t>(world.seconds() * framesPerSecond * subframesPerFrame);
  RecordWriter record(connected::logCode, connected::layout, connected::minimumLength);
  record.set("E-ARFCN", world.cell(place).frequency)
      .set("serving physical cell identity", world.cell(place).code)
      .set("subframe number", subframe % (frameNumbers * subframesPerFrame))
      .set("filtered RSRP", raw(reportedRsrp(world.average(place)), quarterRsrp, 16))
      .set("filtered RSRQ", raw(reportedRsrq(world.average(place)), eighthRsrq, 16));
  writeEntries(record, connected::measured, world.neighbours(), [&](std::size_t other, RecordWriter& entry) {
    entry.set("physical cell identity", world.cell(other).code)
        .set("filtered RSRP", raw(reportedRsrp(world.average(other)), quarterRsrp, 16))
        .set("filtered RSRQ", raw(reportedRsrq(world.average(other)), eighthRsrq, 16));
  });
  writeEntries(record, connected::detected, world.detected(), [&](std::size_t other, RecordWriter& entry) {
    entry.set("physical cell identity", world.cell(other).code);
  });
  return record.bytes();
}

CellList cellListOf(const World& world) {
  CellList list;
  if (!world.serving()) return list;
  list.serving = measured(world, *world.serving());
  for (const auto* places : {&world.neighbours(), &world.otherLayers()}) {
    for (const std::size_t place : *places) list.neighbours.push_back(measured(world, place));
  }
  return list;
}

}  // namespace kelvasi::sim::lte
