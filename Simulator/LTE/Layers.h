// SPDX-License-Identifier: Apache-2.0
// The layers of the town's networks: what cells broadcast for reselection between carriers and technologies
// (3GPP TS 36.331, system information blocks 3 and 5 to 7).
#pragma once

#include <array>

#include "Simulator/Radio/Cell.h"
#include "Simulator/Radio/RadioModel.h"
#include "Simulator/Radio/Town.h"

namespace kelvasi::sim::lte {

struct Layer {
  Technology technology = Technology::lte;
  Plmn network = homePlmn;      // whose carrier it is, in LTE
  std::uint16_t frequency = 0;  // 0 for a technology whose frequencies are one layer
  std::uint8_t resourceBlocks = 0;
  std::uint8_t antennas = 0;
  double share = 1;  // of the network's sites that have a cell of this layer
  std::uint8_t priority = 0;
  int leastLevel = 0;      // dBm, Qrxlevmin
  double leastEcNo = -99;  // dB
  double thresholdHigh;    // dB of Srxlev to come from a layer of lower priority
  double thresholdLow;     // dB of Srxlev to come from a layer of higher priority
};

// The partner has carriers of its own, else the same layers.
constexpr Layer ofPartner(Layer layer, std::uint16_t frequency) {
  layer.network = partnerPlmn;
  layer.frequency = frequency;
  return layer;
}

inline constexpr Layer capacityLayer{.frequency = 3350,
                                     .resourceBlocks = 100,
                                     .antennas = 4,
                                     .share = 0.4,
                                     .priority = 7,
                                     .leastLevel = -120,
                                     .leastEcNo = -18,
                                     .thresholdHigh = 16,
                                     .thresholdLow = 10};
inline constexpr Layer middleLayer{.frequency = 1575,
                                   .resourceBlocks = 75,
                                   .antennas = 2,
                                   .share = 0.7,
                                   .priority = 6,
                                   .leastLevel = -122,
                                   .leastEcNo = -18,
                                   .thresholdHigh = 16,
                                   .thresholdLow = 10};
inline constexpr Layer coverageLayer{.frequency = 6300,
                                     .resourceBlocks = 50,
                                     .antennas = 2,
                                     .priority = 5,
                                     .leastLevel = -124,
                                     .leastEcNo = -18,
                                     .thresholdHigh = 14,
                                     .thresholdLow = 8};

// The share counts in LTE only: the other cells are those of the GSM and UMTS drive.
inline constexpr std::array layers{
    capacityLayer,
    middleLayer,
    coverageLayer,
    ofPartner(capacityLayer, 3100),
    ofPartner(middleLayer, 1850),
    ofPartner(coverageLayer, 6400),
    Layer{.technology = Technology::umts,
          .priority = 3,
          .leastLevel = -110,
          .leastEcNo = -16,
          .thresholdHigh = 12,
          .thresholdLow = 8},
    Layer{.technology = Technology::gsm,
          .priority = 1,
          .leastLevel = -104,
          .thresholdHigh = 12,
          .thresholdLow = 6},
};

// Common to the LTE layers.
inline constexpr int intraSearch = 46;        // dB of Srxlev: a better cell needs no neighbours
inline constexpr int nonIntraSearch = 20;     // dB, the same for layers of equal or lower priority
inline constexpr double leaveThreshold = 10;  // dB of Srxlev below which a lower priority will do
inline constexpr double rankHysteresis = 4;   // dB
inline constexpr int mostTransmitPower = 23;  // dBm, of the handset and as the cells allow it

const Layer& layerOf(const Cell& cell);
// The cell-selection criterion of 3GPP TS 36.304, 5.2.3.2; dB over the least level.
double receiveLevelCriterion(const Cell& cell, const Reception& reception);
bool isSuitable(const Cell& cell, const Reception& reception);

}  // namespace kelvasi::sim::lte
