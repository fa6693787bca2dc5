// SPDX-License-Identifier: Apache-2.0
// A cell of the simulated networks.
#pragma once

#include <cstddef>
#include <cstdint>

namespace kelvasi::sim {

// Metres east and north of the middle of the town.
struct Point {
  double x = 0;
  double y = 0;
};

struct Plmn {
  std::uint16_t mcc = 0;
  std::uint16_t mnc = 0;  // two digits
  bool operator==(const Plmn&) const = default;
};

struct LocationArea {
  Plmn plmn;
  std::uint16_t code = 0;
  bool operator==(const LocationArea&) const = default;
};

enum class Technology { gsm, umts, lte, cdma };
inline constexpr std::size_t technologyCount = 4;

struct Cell {
  Technology technology = Technology::gsm;
  LocationArea locationArea;     // in LTE the tracking area; in CDMA its code is the SID
  std::uint8_t routingArea = 0;  // in CDMA the packet zone
  std::uint32_t id = 0;         // 16 bits in GSM, 28 bits in UMTS and LTE with the RNC's or eNodeB's identity
  std::uint16_t frequency = 0;  // ARFCN of the BCCH, downlink UARFCN or E-ARFCN, CDMA channel
  double megahertz = 2000;      // of the carrier, as far as propagation goes
  std::uint16_t code = 0;       // BSIC, primary scrambling code, physical cell identity, PN offset
  bool isForbidden = false;     // its location area rejects the handset
  bool hasTwoCarriers = false;  // HSDPA on two carriers at once
  bool isTdd = false;           // of UTRA TDD; the code is the cell parameter then
  Point site;
};

}  // namespace kelvasi::sim
