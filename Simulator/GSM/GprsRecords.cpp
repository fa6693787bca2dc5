// SPDX-License-Identifier: Apache-2.0
#include "Simulator/GSM/GprsRecords.h"

#include "LogGenerator/GSM/GPRSCellOptions.h"
#include "LogGenerator/GSM/GPRSRecords.h"
#include "LogGenerator/RecordWriter.h"

namespace kelvasi::sim::gsm {

namespace {

constexpr std::uint8_t allMayAccess = 7;
constexpr std::uint8_t longestDrxTimer = 4;  // seconds
constexpr std::uint8_t t3192Codes = 3;       // the cells use the codes 0 to 2: 500, 1000 and 1500 ms

RecordWriter writer(const RecordRows& record) {
  return RecordWriter(record.logCode, record.layout, record.minimumLength);
}

// Cells differ in what they broadcast, each always the same.
bool isOdd(const World& world) {
  return world.cell(*world.serving()).code % 2 != 0;
}

}  // namespace

std::optional<Bytes> si13Record(const World& world) {
  if (!world.isOn(Technology::gsm)) return std::nullopt;
  return writer(si13::record).set("position", isOdd(world) ? 1 : 0).bytes();
}

std::optional<Bytes> packetAccessRecord(const World& world) {
  if (!world.isOn(Technology::gsm)) return std::nullopt;
  return writer(packetAccess::record)
      .set("PFC support", isOdd(world) ? 1 : 0)
      .set("priority access threshold", allMayAccess)
      .set("network control order", 0)
      .bytes();
}

std::optional<Bytes> gprsCellOptionsRecord(const World& world) {
  if (!world.isOn(Technology::gsm)) return std::nullopt;
  const std::uint16_t code = world.cell(*world.serving()).code;
  return RecordWriter(gprsCellOptions::logCode, gprsCellOptions::layout, gprsCellOptions::minimumLength)
      .set("T3192", code % t3192Codes)
      .set("DRX timer maximum", longestDrxTimer)
      .set("access burst type", isOdd(world) ? 1 : 0)
      .bytes();
}

std::optional<Bytes> pbcchRecord(const World& world) {
  if (!world.isOn(Technology::gsm)) return std::nullopt;
  return writer(pbcch::record).set("PBCCH present", 0).bytes();
}

std::optional<Bytes> packetStatusRecord(const World& world) {
  if (!world.isOn(Technology::gsm)) return std::nullopt;
  return writer(packetStatus::record)
      .set("packet PSI status", 0)
      .set("count LR", 1)
      .set("count HR", isOdd(world) ? 1 : 0)
      .set("extended measurement order", 0)
      .set("packet SI status", 1)
      .bytes();
}

}  // namespace kelvasi::sim::gsm
