// SPDX-License-Identifier: Apache-2.0
#include "Simulator/GSM/GsmRecords.h"

#include <algorithm>
#include <cmath>

#include "LogGenerator/GSM/BSICList.h"
#include "LogGenerator/GSM/GSMCellRecords.h"
#include "LogGenerator/GSM/GSMMeasurements.h"
#include "LogGenerator/GSM/GSMRRRecords.h"
#include "LogGenerator/GSM/HoppingList.h"
#include "Simulator/EntryWriter.h"
#include "Simulator/Handset/CellLayout.h"
#include "Simulator/Handset/CellSelection.h"

namespace kelvasi::sim::gsm {

namespace {

consteval std::uint8_t rr(std::string_view text) {
  return numberOf(rrState::states, text);
}

// RXLEV of 3GPP TS 45.008, 8.1.4.
int receivedLevel(double dBm) {
  return std::clamp(static_cast<int>(std::floor(dBm + 110)), 0, 63);
}

// RXQUAL of 3GPP TS 45.008, 8.2.4: the poorer the level, the more bits are in error.
std::uint32_t receivedQuality(double dBm) {
  return static_cast<std::uint32_t>(std::clamp((-88 - dBm) / 3, 0.0, 7.0));
}

// Words of 32 bits that hold negative numbers as their two's complement.
std::int64_t word(double value) {
  return static_cast<std::uint32_t>(static_cast<std::int32_t>(std::lround(value)));
}

std::uint8_t stateWithoutService(const World& world) {
  if (!world.registration().needsCell()) return rr("RR_INACTIVE");
  return world.registration().isSearching() ? rr("RR_PLMN_LIST_CONSTRUCTION") : rr("RR_NO_CHANNELS");
}

std::uint8_t stateOnUmts(const World& world) {
  if (!world.connection().hasChangedTechnology()) return rr("RR_INACTIVE");
  return world.connection().isConnected() ? rr("RR_G2W_INTERRAT_HANDOVER_ PROGRESS")
                                          : rr("RR_G2W_INTERRAT_RESELECTION_PROGRESS");
}

std::uint8_t stateOnGsm(const World& world) {
  const RadioConnection& connection = world.connection();
  if (connection.hasChangedTechnology())
    return connection.isConnected() ? rr("RR_W2G_INTERRAT_HANDOVER_ PROGRESS")
                                    : rr("RR_W2G_INTERRAT_RESELECTION_PROGRESS");
  if (connection.isConnecting()) return rr("RR_CONNECTION_PENDING");
  if (connection.isConnected()) return rr("RR_DATA_TRANSFER");
  if (connection.isReleasing()) return rr("RR_CONNECTION_RELEASE");
  return world.hasChangedCell() ? rr("RR_CELL_RESELECTION") : rr("RR_IDLE");
}

std::uint8_t stateOf(const World& world) {
  if (!world.serving()) return stateWithoutService(world);
  return world.isOn(Technology::umts) ? stateOnUmts(world) : stateOnGsm(world);
}

const Cell* servingGsmCell(const World& world) {
  return world.isOn(Technology::gsm) ? &world.cell(*world.serving()) : nullptr;
}

const Cell* dedicatedCell(const World& world) {
  return world.connection().isDedicated() ? servingGsmCell(world) : nullptr;
}

}  // namespace

std::optional<Bytes> rrStateRecord(const World& world) {
  const auto& record = rrState::record;
  const bool isData = world.registration().packetSwitched().need() == Need::data;
  return RecordWriter(record.logCode, record.layout, record.minimumLength)
      .set("state", stateOf(world))
      .set("mode", isData ? 1 : 0)
      .bytes();
}

std::optional<Bytes> gsmCellIdentityRecord(const World& world) {
  const Cell* cell = servingGsmCell(world);
  if (!cell) return std::nullopt;
  const auto& record = gsmCellIdentity::record;
  return RecordWriter(record.logCode, record.layout, record.minimumLength)
      .set("ARFCN", cell->frequency)
      .set("BSIC", cell->code)
      .set("cell identity", cell->id)
      .bytes();
}

std::optional<Bytes> bsicListRecord(const World& world) {
  if (!servingGsmCell(world)) return std::nullopt;
  RecordWriter record(bsicList::logCode, bsicList::layout, bsicList::minimumLength);
  writeEntries(record, bsicList::cells, world.gsmNeighbours(), [&](std::size_t place, RecordWriter& entry) {
    entry.set("ARFCN", world.cell(place).frequency).set("BSIC", world.cell(place).code);
  });
  return record.bytes();
}

// In a call the words of C1 and C2 carry the receive quality.
std::optional<Bytes> gsmMeasurementsRecord(const World& world) {
  if (!servingGsmCell(world)) return std::nullopt;
  const Reception& serving = world.reception(*world.serving());
  const bool isDedicated = world.connection().isDedicated();
  const std::int64_t quality = receivedQuality(serving.level);
  RecordWriter record(gsmMeasurements::logCode, gsmMeasurements::layout, gsmMeasurements::minimumLength);
  record.set("receive level", receivedLevel(serving.level))
      .set("C1 or full receive quality", isDedicated ? quality : word(criterionC1(serving)))
      .set("C2 or sub receive quality", isDedicated ? quality : word(criterionC2(serving)))
      .set("reselect hysteresis", world.connection().isConnected() ? 0 : 1);
  writeEntries(record, gsmMeasurements::neighbours, world.gsmNeighbours(),
               [&](std::size_t place, RecordWriter& entry) {
                 entry.set("ARFCN", world.cell(place).frequency)
                     .set("RSSI", receivedLevel(world.reception(place).level))
                     .set("C1", word(criterionC1(world.reception(place))));
               });
  return record.bytes();
}

std::optional<Bytes> dedicatedChannelRecord(const World& world) {
  const Cell* cell = dedicatedCell(world);
  if (!cell) return std::nullopt;
  const auto& record = dedicatedChannel::record;
  return RecordWriter(record.logCode, record.layout, record.minimumLength)
      .set("dedicated ARFCN", hoppingFrequencies(*cell).front())
      .bytes();
}

std::optional<Bytes> mobileAllocationRecord(const World& world) {
  const Cell* cell = dedicatedCell(world);
  if (!cell) return std::nullopt;
  RecordWriter record(hoppingList::logCode, hoppingList::layout, hoppingList::minimumLength);
  record.set("hopping sequence number", cell->code);
  writeEntries(record, hoppingList::frequencies, hoppingFrequencies(*cell),
               [](std::uint16_t arfcn, RecordWriter& entry) { entry.set("ARFCN", arfcn); });
  return record.bytes();
}

std::optional<Bytes> dtxRecord(const World& world) {
  if (!servingGsmCell(world)) return std::nullopt;
  const auto& record = dtx::record;
  return RecordWriter(record.logCode, record.layout, record.minimumLength)
      .set("DTX in use", world.connection().hasSpeech() ? 1 : 0)
      .bytes();
}

}  // namespace kelvasi::sim::gsm
