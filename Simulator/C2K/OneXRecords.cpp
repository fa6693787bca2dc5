// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/OneXRecords.h"

#include <algorithm>
#include <cmath>

#include "LogGenerator/C2K/DeviceStatus.h"
#include "LogGenerator/C2K/Fingers.h"
#include "LogGenerator/C2K/NoPilot.h"
#include "LogGenerator/C2K/SubPackets.h"
#include "LogGenerator/C2K/SystemParameters.h"
#include "LogGenerator/C2K/TrafficFER.h"
#include "LogGenerator/RecordWriter.h"
#include "Simulator/C2K/Strength.h"

namespace kelvasi::sim::c2k {

namespace {

// How the searcher adds up a pilot's energy.
constexpr std::int64_t window = 512;  // chips
constexpr std::int64_t gain = 8;
constexpr std::int64_t exponent = 6;
constexpr double energyPerRatio =
    static_cast<double>(gain * 9 * window * window) / static_cast<double>(1 << (2 * exponent - 3));

constexpr std::int64_t protocolRevision = 6;  // P_REV of IS-2000
constexpr std::int64_t systemVersion = 2;
// Numbers of the roaming indicator's table.
constexpr std::int64_t indicatorOff = 0;
constexpr std::int64_t indicatorOn = 1;

void put16(Bytes& bytes, std::size_t at, std::int64_t value) {
  bytes.at(at) = static_cast<std::uint8_t>(value);
  bytes.at(at + 1) = static_cast<std::uint8_t>(value >> 8);
}

Bytes subPacket(std::int64_t id, Bytes fields) {
  const Bytes header = RecordWriter(subPackets::headerLayout)
                           .set("id", id)
                           .set("size", static_cast<std::int64_t>(fields.size()))
                           .bytes();
  std::ranges::copy(header, fields.begin());
  return fields;
}

RecordWriter subPacketRecord(LogCode logCode, std::int64_t count) {
  return RecordWriter(logCode, subPackets::layout, subPackets::first).set("count", count);
}

std::int64_t receiverGain(double dBm) {
  return std::clamp<std::int64_t>(std::lround((dBm + 63.248) * 1000 / 334), -128, 127);
}

Bytes radioSubPacket(const World& world) {
  using namespace deviceStatus;
  return subPacket(radioId, RecordWriter(radioLayout)
                                .set("Rx 0 band class", bandClass)
                                .set("Rx 1 band class", bandClass)
                                .set("Rx 0 channel", oneXChannel)
                                .set("Rx 1 channel", oneXChannel)
                                .set("Rx 0 AGC", receiverGain(world.receivedPower(0)))
                                .set("Rx 1 AGC", receiverGain(world.receivedPower(1)))
                                .set("Tx AGC", std::lround(world.oneXTransmitPower() * 10))
                                .bytes());
}

std::int64_t pilotEnergy(double ratio) {
  const double energy = (std::pow(10, ratio / 10) + 1.0 / window) * energyPerRatio;
  return std::clamp<std::int64_t>(std::lround(energy), 0, 65535);
}

// The places of the pilots count from the sub-packet's own start.
Bytes activeSetSubPacket(const World& world) {
  using namespace deviceStatus;
  const auto& active = world.oneX().pilots().active();
  const auto fingers = static_cast<std::int64_t>(World::fingerCount);
  Bytes bytes = RecordWriter(activeSetLayout)
                    .set("window", window)
                    .set("gain", gain)
                    .set("energy exponent", exponent)
                    .set("count", static_cast<std::int64_t>(active.size()))
                    .set("fingers", fingers)
                    .set("reference PN offset", active.empty() ? noPilot : world.cell(active.front()).code)
                    .bytes();
  for (std::size_t place = 0; place < active.size(); ++place) {
    const std::size_t pilot = pilotStride(fingers) * place;
    const std::size_t energy = pilot + pilotEnergyAt(fingers);
    bytes.resize(energy + 4);
    put16(bytes, pilot + fieldIn(pilotLayout, "PN offset").byte, world.cell(active[place]).code);
    put16(bytes, energy, pilotEnergy(reportedRatio(world.oneXRatios()[active[place]])));
  }
  return subPacket(activeSetId, std::move(bytes));
}

}  // namespace

std::optional<Bytes> deviceStatusRecord(const World& world) {
  using namespace deviceStatus;
  const auto state = static_cast<std::int64_t>(world.oneX().state());
  return subPacketRecord(logCode, 4)
      .append(subPacket(stateId, RecordWriter(stateLayout).set("state", state).padTo(8).bytes()))
      .append(radioSubPacket(world))
      .append(activeSetSubPacket(world))
      .append(subPacket(fingersId, Bytes(8)))
      .bytes();
}

std::optional<Bytes> systemParametersRecord(const World& world) {
  using namespace systemParameters;
  if (!world.oneX().hasSystem()) return std::nullopt;
  const Cell& cell = world.cell(world.oneX().pilots().active().front());
  const System& system = systemOf(cell);
  return RecordWriter(logCode, layout, minimumLength)
      .set("version", systemVersion)
      .set("roaming indicator", system.isHome ? indicatorOff : indicatorOn)
      .set("system type", cdmaSystem)
      .set("system identity", system.systemId)
      .set("network identity", system.networkId)
      .set("packet zone identity", cell.routingArea)
      .set("protocol revision", protocolRevision)
      .set("base identity", cell.id)
      .bytes();
}

std::optional<Bytes> fingersRecord(const World& world) {
  using namespace fingers;
  RecordWriter record(logCode, layout, firstFinger);
  record.set("count", static_cast<std::int64_t>(world.fingers().size()));
  for (const Finger& finger : world.fingers()) {
    RecordWriter entry(fingerLayout, fingerSize);
    entry.set("PN offset", finger.cell ? world.cell(*finger.cell).code : noPilot)
        .set("C/I", finger.cell ? strengthOf(finger.ratio) : 0);
    record.append(entry.bytes());
  }
  return record.bytes();
}

Bytes trafficFrameRecord(bool isError) {
  using namespace trafficFER;
  return subPacketRecord(logCode, 1)
      .append(
          subPacket(demodulationId,
                    RecordWriter(demodulationLayout).set("frame error", isError ? 1 : 0).padTo(28).bytes()))
      .bytes();
}

}  // namespace kelvasi::sim::c2k
