// SPDX-License-Identifier: Apache-2.0
// The operating bands of E-UTRA, their carrier numbers and channel bandwidths (3GPP TS 36.101, tables 5.5-1,
// 5.6.1-1 and 5.7.3-1), as far as a carrier number of 16 bits reaches.
#pragma once

#include <cstdint>

namespace kelvasi::sim {

struct EutraBand {
  std::uint8_t number;
  double downlinkMegahertz;  // the lowest frequency
  std::uint16_t firstDownlink;
  std::uint16_t lastDownlink;
  double uplinkMegahertz;
  std::uint16_t firstUplink;
  std::uint8_t bandwidths;  // bits, from 1.4 MHz up
};

// By downlink E-ARFCN. Null for one in no band.
const EutraBand* eutraBandOf(std::uint16_t earfcn);

// Of an E-ARFCN in a band; MHz.
double downlinkMegahertz(std::uint16_t earfcn);
double uplinkMegahertz(std::uint16_t earfcn);
// The uplink E-ARFCN that belongs to a downlink one in a band; in TDD the same.
std::uint16_t uplinkEarfcn(std::uint16_t earfcn);

// MHz by the number of resource blocks; 0 for a number that no bandwidth has.
double megahertzOfBlocks(std::uint8_t resourceBlocks);
bool allowsBandwidth(const EutraBand& band, std::uint8_t resourceBlocks);

}  // namespace kelvasi::sim
