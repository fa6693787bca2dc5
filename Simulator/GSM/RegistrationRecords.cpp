// SPDX-License-Identifier: Apache-2.0
#include "Simulator/GSM/RegistrationRecords.h"

#include "LogGenerator/GSM/EquivalentPLMN.h"
#include "LogGenerator/GSM/GMMState.h"
#include "LogGenerator/GSM/MMState.h"
#include "LogGenerator/GSM/RegisteredPLMN.h"
#include "LogGenerator/GSM/RegistrationState.h"
#include "LogGenerator/RecordWriter.h"
#include "Simulator/Handset/CellLayout.h"

namespace kelvasi::sim::gsm {

namespace {

constexpr std::uint8_t networkModeTwo = 1;  // mode II: paging of both domains on one channel, no Gs interface
constexpr std::uint8_t fillerDigit = 0xF;

std::uint8_t hundreds(std::uint16_t code) {
  return static_cast<std::uint8_t>(code / 100 % 10);
}
std::uint8_t tens(std::uint16_t code) {
  return static_cast<std::uint8_t>(code / 10 % 10);
}
std::uint8_t units(std::uint16_t code) {
  return static_cast<std::uint8_t>(code % 10);
}

Bytes equivalentEntry(Plmn plmn) {
  return RecordWriter(equivalentPlmn::entryLayout)
      .set("MCC hundreds", hundreds(plmn.mcc))
      .set("MNC hundreds", hundreds(plmn.mnc))
      .set("MCC tens", tens(plmn.mcc))
      .set("MNC tens", tens(plmn.mnc))
      .set("MCC units", units(plmn.mcc))
      .set("MNC units", units(plmn.mnc))
      .bytes();
}

}  // namespace

Bytes gmmStateRecord(const Registration& registration) {
  const PacketSwitched& domain = registration.packetSwitched();
  return RecordWriter(gmmState::logCode, gmmState::layout, gmmState::minimumLength)
      .set("state", domain.state())
      .set("sub-state", domain.subState())
      .set("update status", static_cast<std::uint8_t>(domain.updateStatus()))
      .bytes();
}

Bytes mmStateRecord(const Registration& registration) {
  const CircuitSwitched& domain = registration.circuitSwitched();
  return RecordWriter(mmState::logCode, mmState::layout, mmState::minimumLength)
      .set("state", domain.state())
      .set("sub-state", domain.subState())
      .set("update status", static_cast<std::uint8_t>(domain.updateStatus()))
      .bytes();
}

Bytes registrationStateRecord(const Registration& registration) {
  return RecordWriter(registrationState::logCode, registrationState::layout, registrationState::minimumLength)
      .set("registration state", registration.registrationState())
      .set("PLMN selection mode", registration.selectionMode())
      .bytes();
}

Bytes registeredPlmnRecord(const Registration& registration) {
  const Cell& cell = registration.lastCell();
  const Plmn plmn = cell.locationArea.plmn;
  return RecordWriter(registeredPlmn::logCode, registeredPlmn::layout, registeredPlmn::minimumLength)
      .set("network operating mode", networkModeTwo)
      .set("service type", registration.serviceType())
      .set("MCC digit 1", hundreds(plmn.mcc))
      .set("MCC digit 2", tens(plmn.mcc))
      .set("MCC digit 3", units(plmn.mcc))
      .set("MNC digit 1", tens(plmn.mnc))
      .set("MNC digit 2", units(plmn.mnc))
      .set("MNC digit 3", fillerDigit)
      .set("location area code", cell.locationArea.code)
      .set("routing area code", cell.routingArea)
      .bytes();
}

// What the network gave with the last accepted update: the other one of the two equivalent networks.
Bytes equivalentPlmnRecord(const Registration& registration) {
  const bool isRegistered =
      registration.circuitSwitched().isRegistered() || registration.packetSwitched().isRegistered();
  RecordWriter record(equivalentPlmn::logCode, equivalentPlmn::layout, equivalentPlmn::minimumLength);
  record.set("count", isRegistered ? 1 : 0);
  const bool isHome = registration.lastCell().locationArea.plmn == homePlmn;
  if (isRegistered) record.append(equivalentEntry(isHome ? partnerPlmn : homePlmn));
  return record.bytes();
}

}  // namespace kelvasi::sim::gsm
