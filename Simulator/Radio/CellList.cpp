#include "Simulator/Radio/CellList.h"

#include "LogGenerator/LogCode.h"
#include "Simulator/PropertyListRecord.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi::sim {

namespace {

constexpr int notMeasured = 32767;

void set(PlistDictionary& entry, std::string_view key, PlistValue value) {
  entry.set(key, std::move(value));
}

void setIdentity(PlistDictionary& entry, const Cell& cell) {
  set(entry, kTelvonCellMonitorMCC, cell.locationArea.plmn.mcc);
  set(entry, kTelvonCellMonitorMNC, cell.locationArea.plmn.mnc);
  set(entry, kTelvonCellMonitorLAC, cell.locationArea.code);
  set(entry, kTelvonCellMonitorCellId, cell.id);
}

// The list counts a GSM level in steps of 2 dB.
void setGsmMeasurement(PlistDictionary& entry, const MeasuredCell& measured) {
  set(entry, kTelvonCellMonitorARFCN, measured.cell.frequency);
  set(entry, kTelvonCellMonitorRSSI, measured.level ? *measured.level / 2 : notMeasured);
}

void setUmtsMeasurement(PlistDictionary& entry, const MeasuredCell& measured) {
  set(entry, kTelvonCellMonitorUARFCN, measured.cell.frequency);
  set(entry, kTelvonCellMonitorSCN, measured.cell.code);
  set(entry, kTelvonCellMonitorRSCP, measured.level.value_or(notMeasured));
  set(entry, kTelvonCellMonitorECN0, measured.ecNo.value_or(notMeasured));
}

PlistValue::Dictionary entryOf(const MeasuredCell& measured, std::string_view type) {
  const auto entry = PlistDictionary::make();
  const bool isGsm = measured.cell.technology == Technology::gsm;
  set(*entry, kTelvonCellMonitorCellRadioAccessTechnology,
      isGsm ? kTelvonCellMonitorRadioAccessTechnologyGSM : kTelvonCellMonitorRadioAccessTechnologyUMTS);
  set(*entry, kTelvonCellMonitorCellType, type);
  if (type == kTelvonCellMonitorCellTypeServing) setIdentity(*entry, measured.cell);
  isGsm ? setGsmMeasurement(*entry, measured) : setUmtsMeasurement(*entry, measured);
  return entry;
}

}  // namespace

std::optional<Bytes> cellInfoRecord(const CellList& cells, const PlistSerialiser& plists) {
  const auto list = PlistArray::make();
  if (cells.serving) list->append(entryOf(*cells.serving, kTelvonCellMonitorCellTypeServing));
  for (const MeasuredCell& neighbour : cells.neighbours)
    list->append(entryOf(neighbour, kTelvonCellMonitorCellTypeNeighbor));
  return propertyListRecord(cellInfoLogCode, list, plists);
}

}  // namespace kelvasi::sim
