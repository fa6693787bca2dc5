// SPDX-License-Identifier: Apache-2.0
#include "Simulator/GSM/UmtsRecords.h"

#include <array>
#include <cmath>

#include "LogGenerator/GSM/HARQStatistics.h"
#include "LogGenerator/GSM/TransportChannelCRC.h"
#include "LogGenerator/GSM/UMTSRRRecords.h"
#include "Simulator/EntryWriter.h"

namespace kelvasi::sim::gsm {

namespace {

constexpr std::uint16_t duplexSpacing = 950;  // UARFCN, band I
constexpr std::uint8_t hsdpaVersion = 1;
constexpr std::uint8_t singleCarrier = 0;
constexpr std::uint8_t dualCarrier = 2;
constexpr std::array<double, 4> powerRipple{-0.4, 0.3, -0.1, 0.2};  // dB, of the fast power control

// Tenths of a dB over -70 dBm, less 512. The value 0 would stand for none.
std::int64_t transmitAgc(double dBm) {
  const std::int64_t raw = std::llround((dBm + 70) * 10) - 512;
  return raw == 0 ? 1 : raw;
}

void encodeProcess(const HarqProcess& process, RecordWriter& entry) {
  entry.set("process", process.id)
      .set("bits received", process.bitsReceived)
      .set("new transmissions", process.newTransmissions)
      .set("block errors", process.blockErrors);
}

}  // namespace

std::optional<Bytes> rrcStateRecord(const World& world) {
  const auto& record = rrcState::record;
  return RecordWriter(record.logCode, record.layout, record.minimumLength)
      .set("RRC state", static_cast<std::uint8_t>(world.connection().rrc()))
      .bytes();
}

std::optional<Bytes> transmitPowerRecord(const World& world) {
  const auto rrc = world.connection().rrc();
  if (rrc != RadioConnection::Rrc::dch && rrc != RadioConnection::Rrc::fach) return std::nullopt;
  RecordWriter record(transmitPower::logCode, transmitPower::layout, transmitPower::minimumLength);
  writeEntries(record, transmitPower::samples, powerRipple, [&](double ripple, RecordWriter& entry) {
    entry.set("transmit AGC", transmitAgc(world.transmitPower() + ripple));
  });
  return record.bytes();
}

std::optional<Bytes> umtsServingCellRecord(const World& world) {
  if (!world.isOn(Technology::umts)) return std::nullopt;
  const Cell& cell = world.cell(*world.serving());
  return RecordWriter(umtsServingCell::logCode, umtsServingCell::layout, umtsServingCell::minimumLength)
      .set("uplink UARFCN", cell.frequency - duplexSpacing)
      .set("downlink UARFCN", cell.frequency)
      .set("cell identity", cell.id)
      .set("URA identity", cell.routingArea)
      .bytes();
}

std::optional<Bytes> cipheringRecord(const World& world) {
  const auto& record = ciphering::record;
  return RecordWriter(record.logCode, record.layout, record.minimumLength)
      .set("ciphering", world.isOn(Technology::umts) && world.connection().isCiphered() ? 1 : 0)
      .bytes();
}

std::optional<Bytes> hsdpaRecord(const World& world) {
  const Traffic& traffic = world.traffic();
  if (traffic.primary().empty()) return std::nullopt;
  RecordWriter record(harqStatistics::logCode, harqStatistics::layout, harqStatistics::minimumLength);
  record.set("version", hsdpaVersion)
      .set("sub-frames", Traffic::subFrames)
      .set("carriers", traffic.secondary().empty() ? singleCarrier : dualCarrier);
  writeEntries(record, harqStatistics::primary, traffic.primary(), encodeProcess);
  writeEntries(record, harqStatistics::secondary, traffic.secondary(), encodeProcess);
  return record.bytes();
}

std::optional<Bytes> blockErrorRecord(const World& world) {
  const Traffic& traffic = world.traffic();
  if (traffic.channels().empty()) return std::nullopt;
  RecordWriter record(transportChannelCrc::logCode, transportChannelCrc::layout,
                      transportChannelCrc::minimumLength);
  record.set("window size", Traffic::windowSize);
  writeEntries(record, transportChannelCrc::channels, traffic.channels(),
               [](const TransportChannel& channel, RecordWriter& entry) {
                 entry.set("transport channel", channel.id)
                     .set("CRCs received", channel.received)
                     .set("CRCs in error", channel.inError);
               });
  return record.bytes();
}

}  // namespace kelvasi::sim::gsm
