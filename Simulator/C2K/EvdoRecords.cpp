// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/EvdoRecords.h"

#include <cmath>

#include "LogGenerator/C2K/EvdoActiveSet.h"
#include "LogGenerator/C2K/EvdoRates.h"
#include "LogGenerator/C2K/EvdoStatus.h"
#include "LogGenerator/C2K/NoPilot.h"
#include "LogGenerator/RecordWriter.h"
#include "Simulator/C2K/Strength.h"

namespace kelvasi::sim::c2k {

namespace {

constexpr std::array counterLayout{Field{.name = "packets", .byte = 0, .width = 32}};

// Off, and done with telling that it is.
bool isSilent(const World& world) {
  return world.evdo().state() == Evdo::State::inactive && world.dataLink().hasToldItsEnd();
}

Bytes counterBytes(std::uint32_t packets) {
  return RecordWriter(counterLayout).set("packets", packets).bytes();
}

}  // namespace

std::optional<Bytes> evdoStatusRecord(const World& world) {
  using namespace evdoStatus;
  const Evdo& evdo = world.evdo();
  return RecordWriter(logCode, layout, length)
      .set("channel", evdoChannel)
      .set("band class", bandClass)
      .set("Rx AGC 0", std::lround(world.receivedPower(0)))
      .set("Rx AGC 1", std::lround(world.receivedPower(1)))
      .set("Tx AGC", std::lround(world.evdoTransmitPower()))
      .set("serving PN offset", evdo.serving() ? world.cell(*evdo.serving()).code : noPilot)
      .set("device state", static_cast<std::int64_t>(evdo.state()))
      .set("session state", static_cast<std::int64_t>(evdo.session()))
      .set("UATI24", evdo.uati24())
      .set("color code", evdo.colorCode())
      .bytes();
}

std::optional<Bytes> evdoActiveSetRecord(const World& world) {
  using namespace evdoActiveSet;
  const auto& active = world.evdo().pilots().active();
  RecordWriter record(logCode, layout, firstPilot);
  record.set("count", static_cast<std::int64_t>(active.size()));
  for (const std::size_t pilot : active) {
    record.append(RecordWriter(pilotLayout, pilotSize)
                      .set("PN offset", world.cell(pilot).code)
                      .set("strength", strengthOf(world.evdoRatios()[pilot]))
                      .bytes());
  }
  return record.bytes();
}

std::optional<Bytes> forwardRateRecord(const World& world) {
  using namespace evdoForwardRate;
  if (isSilent(world)) return std::nullopt;
  const auto& report = world.dataLink().forward();
  RecordWriter record(logCode, layout, firstCounter);
  record.set("sequence number", report.sequence);
  for (const std::uint32_t packets : report.counters) record.append(counterBytes(packets));
  return record.bytes();
}

std::optional<Bytes> reverseRateRecord(const World& world) {
  using namespace evdoReverseRate;
  if (isSilent(world)) return std::nullopt;
  const auto& report = world.dataLink().reverse();
  RecordWriter record(logCode, layout, firstCounter);
  record.set("sequence number", report.sequence);
  const Bytes rest(rateStep - counters * counterStep);  // two counters of each rate that are not told of
  for (const auto& interlace : report.counters) {
    for (const auto& mode : interlace) {
      for (const auto& rate : mode) {
        for (const std::uint32_t packets : rate) record.append(counterBytes(packets));
        record.append(rest);
      }
    }
  }
  return record.padTo(minimumLength).bytes();
}

}  // namespace kelvasi::sim::c2k
