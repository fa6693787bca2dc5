// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Daemon/CellList.h"

#include <cmath>

#include "LogGenerator/Daemon/CellRows.h"
#include "LogGenerator/LogCode.h"
#include "Radio/Channels.h"
#include "Simulator/Daemon/PropertyListRecord.h"
#include "Simulator/Radio/Reported.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi::sim {

namespace {

int whole(double value) {
  return static_cast<int>(std::lround(value));
}

constexpr int tddBandA = 1;  // 3GPP TS 25.102, 5.2, counted from a

void set(PlistDictionary& entry, std::string_view key, PlistValue value) {
  entry.set(key, std::move(value));
}

// The list counts a GSM level in steps of 2 dB.
void setGsm(PlistDictionary& entry, const MeasuredCell& measured) {
  set(entry, kTelvonCellMonitorARFCN, measured.cell.frequency);
  set(entry, kTelvonCellMonitorRSSI, measured.level ? *measured.level / 2 : notMeasured);
}

void setUmts(PlistDictionary& entry, const MeasuredCell& measured) {
  set(entry, kTelvonCellMonitorUARFCN, measured.cell.frequency);
  set(entry, kTelvonCellMonitorSCN, measured.cell.code);
  set(entry, kTelvonCellMonitorRSCP, measured.level.value_or(notMeasured));
  set(entry, kTelvonCellMonitorECN0, measured.ecNo.value_or(notMeasured));
}

void setUtran(PlistDictionary& entry, const MeasuredCell& measured) {
  setUmts(entry, measured);
  set(entry, kTelvonCellMonitorBandInfo, tddBandA);
}

void setLte(PlistDictionary& entry, const MeasuredCell& measured) {
  set(entry, kTelvonCellMonitorUARFCN, measured.cell.frequency);
  set(entry, kTelvonCellMonitorPID, measured.cell.code);
  for (const Carrier& carrier : eutraCarriers(measured.cell.frequency))
    set(entry, kTelvonCellMonitorBandInfo, carrier.band.number);
}

struct Kind {
  std::string_view technology;
  std::string_view area;  // key of the location or tracking area
  void (*set)(PlistDictionary& entry, const MeasuredCell& measured);
};
constexpr Kind gsm{kTelvonCellMonitorRadioAccessTechnologyGSM, kTelvonCellMonitorLAC, setGsm};
constexpr Kind umts{kTelvonCellMonitorRadioAccessTechnologyUMTS, kTelvonCellMonitorLAC, setUmts};
constexpr Kind utran{kTelvonCellMonitorRadioAccessTechnologyUTRAN2, kTelvonCellMonitorLAC, setUtran};
constexpr Kind lte{kTelvonCellMonitorRadioAccessTechnologyLTE, kTelvonCellMonitorTAC, setLte};

const Kind& kindOf(const Cell& cell) {
  if (cell.technology == Technology::gsm) return gsm;
  if (cell.technology == Technology::lte) return lte;
  return cell.isTdd ? utran : umts;
}

void setIdentity(PlistDictionary& entry, const Cell& cell) {
  set(entry, kTelvonCellMonitorMCC, cell.locationArea.plmn.mcc);
  set(entry, kTelvonCellMonitorMNC, cell.locationArea.plmn.mnc);
  set(entry, kindOf(cell).area, cell.locationArea.code);
  set(entry, kTelvonCellMonitorCellId, cell.id);
}

PlistValue::Dictionary entryOf(const MeasuredCell& measured, std::string_view type) {
  const auto entry = PlistDictionary::make();
  const Kind& kind = kindOf(measured.cell);
  set(*entry, kTelvonCellMonitorCellRadioAccessTechnology, kind.technology);
  set(*entry, kTelvonCellMonitorCellType, type);
  if (type == kTelvonCellMonitorCellTypeServing) setIdentity(*entry, measured.cell);
  kind.set(*entry, measured);
  return entry;
}

}  // namespace

MeasuredCell measuredCell(const Cell& cell, const Reception& heard) {
  if (cell.technology == Technology::gsm)
    return {.cell = cell, .level = whole(reportedGsmLevel(heard)), .ecNo = {}};
  return {.cell = cell, .level = whole(reportedRscp(heard)), .ecNo = whole(reportedEcNo(heard))};
}

std::optional<Bytes> cellInfoRecord(const CellList& cells, const PlistSerialiser& plists) {
  const auto list = PlistArray::make();
  if (cells.serving) list->append(entryOf(*cells.serving, kTelvonCellMonitorCellTypeServing));
  for (const MeasuredCell& neighbour : cells.neighbours)
    list->append(entryOf(neighbour, kTelvonCellMonitorCellTypeNeighbor));
  return propertyListRecord(cellInfoLogCode, list, plists);
}

}  // namespace kelvasi::sim
