// SPDX-License-Identifier: Apache-2.0
#include "Simulator/ObjectStream/HandsetObject.h"

#include <cmath>
#include <string>

#include "Simulator/Radio/Reported.h"

namespace kelvasi::sim::objectStream {

namespace {

using gsm::RadioConnection;
using gsm::World;
using Object = PlistValue::Dictionary;

std::string withUnit(double value, const char* unit) {
  return std::to_string(std::lround(value)) + unit;
}

std::string ofTwoDigits(std::uint16_t number) {
  return (number < 10 ? "0" : "") + std::to_string(number);
}

const char* nameOf(Technology technology) {
  return technology == Technology::gsm ? "GSM" : "UMTS";
}

PlistValue stateOnly(std::string_view state) {
  return PlistDictionary::make({{"State", state}});
}

void addMeasurements(const World& world, std::size_t place, PlistDictionary& rows) {
  const Cell& cell = world.cell(place);
  const bool isGsm = cell.technology == Technology::gsm;
  rows.set(isGsm ? "ARFCN" : "UARFCN", std::to_string(cell.frequency));
  rows.set(isGsm ? "BSIC" : "Scrambling Code", std::to_string(cell.code));
  const auto& heard = world.reception(place);
  if (isGsm) {
    rows.set("Received Level", withUnit(reportedGsmLevel(heard), " dBm"));
  } else {
    rows.set("RSCP", withUnit(reportedRscp(heard), " dBm"));
    rows.set("Ec/No", withUnit(reportedEcNo(heard), " dB"));
  }
}

// Wrapped in the name of its technology.
PlistValue servingCell(const World& world) {
  const auto place = world.serving();
  if (!place) return PlistDictionary::make();
  const Cell& cell = world.cell(*place);
  const Object rows = PlistDictionary::make(
      {{"Cell ID", std::to_string(cell.id)}, {"Location Area Code", std::to_string(cell.locationArea.code)}});
  addMeasurements(world, *place, *rows);
  return PlistDictionary::make({{nameOf(cell.technology), rows}});
}

PlistValue neighbours(const World& world, const std::vector<std::size_t>& places) {
  const auto list = PlistArray::make();
  for (const std::size_t place : places) {
    const Object rows = PlistDictionary::make();
    addMeasurements(world, place, *rows);
    list->append(PlistDictionary::make({{"Cell", rows}}));
  }
  return list;
}

PlistValue neighbourLists(const World& world) {
  const Object lists = PlistDictionary::make();
  if (!world.gsmNeighbours().empty()) lists->set("GSM", neighbours(world, world.gsmNeighbours()));
  if (!world.umtsNeighbours().empty()) lists->set("UMTS", neighbours(world, world.umtsNeighbours()));
  return lists;
}

PlistValue network(const World& world) {
  const auto& registration = world.registration();
  const auto& area = registration.lastCell().locationArea;
  const Object packet = PlistDictionary::make({{"State", registration.packetSwitched().stateName()}});
  const auto contexts = PlistArray::make();
  for (const auto& context : registration.packetSwitched().contexts()) {
    contexts->append(
        PlistDictionary::make({{"Access Point", context.accessPoint}, {"Address", context.address}}));
  }
  if (!contexts->empty()) packet->set("Contexts", contexts);
  return PlistDictionary::make({{"PLMN", PlistDictionary::make({{"MCC", std::to_string(area.plmn.mcc)},
                                                                {"MNC", ofTwoDigits(area.plmn.mnc)}})},
                                {"Circuit Switched", stateOnly(registration.circuitSwitched().stateName())},
                                {"Packet Switched", packet}});
}

std::string_view connectionState(const RadioConnection& connection) {
  if (connection.isConnecting()) return "Connecting";
  if (connection.isReleasing()) return "Releasing";
  return connection.isConnected() ? "Connected" : "Idle";
}

// A chain of dictionaries of one entry each while there is no connection.
PlistValue connection(const World& world) {
  const RadioConnection& connection = world.connection();
  const Object radio = PlistDictionary::make({{"Radio Resources", stateOnly(connectionState(connection))}});
  if (!connection.isConnected()) return radio;
  radio->set("Ciphering", connection.isCiphered() ? "Enabled" : "Disabled");
  if (connection.hasSpeech()) radio->set("Service", "Speech");
  if (connection.isTransferring()) radio->set("Service", "Packet Data");
  if (world.isOn(Technology::umts)) radio->set("Transmit Power", withUnit(world.transmitPower(), " dBm"));
  return radio;
}

}  // namespace

PlistValue handsetObject(const World& world) {
  return PlistDictionary::make(
      {{"Power", PlistDictionary::make({{"Handset", stateOnly(world.registration().isOn() ? "On" : "Off")}})},
       {"Network", network(world)},
       {"Serving Cell", servingCell(world)},
       {"Neighbor Cells", neighbourLists(world)},
       {"Connection", connection(world)}});
}

}  // namespace kelvasi::sim::objectStream
