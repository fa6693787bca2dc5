// A cell of the simulated networks.
#pragma once

#include <cstdint>

namespace kelvasi::sim::gsm {

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

enum class Technology { gsm, umts };

struct Cell {
  Technology technology = Technology::gsm;
  LocationArea locationArea;
  std::uint8_t routingArea = 0;
  std::uint32_t id = 0;         // 16 bits in GSM, 28 bits with the RNC's identity in UMTS
  std::uint16_t frequency = 0;  // ARFCN of the BCCH, or downlink UARFCN
  std::uint16_t code = 0;       // BSIC, or primary scrambling code
  bool isForbidden = false;     // its location area rejects the handset
  bool hasTwoCarriers = false;  // HSDPA on two carriers at once
  Point site;
};

}  // namespace kelvasi::sim::gsm
