// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Radio/EutraBand.h"

#include <algorithm>
#include <array>

namespace kelvasi::sim {

namespace {

struct Bandwidth {
  std::uint8_t resourceBlocks;
  double megahertz;
};
constexpr std::array bandwidths{Bandwidth{6, 1.4}, Bandwidth{15, 3},  Bandwidth{25, 5},
                                Bandwidth{50, 10}, Bandwidth{75, 15}, Bandwidth{100, 20}};

// By the places of these bandwidths.
constexpr std::uint8_t all = 0b111111;
constexpr std::uint8_t to10 = 0b001111;
constexpr std::uint8_t from5 = 0b111100;
constexpr std::uint8_t from5To10 = 0b001100;
constexpr std::uint8_t from5To15 = 0b011100;

constexpr double megahertzPerStep = 0.1;

constexpr std::array bands{
    EutraBand{1, 2110, 0, 599, 1920, 18000, from5},
    EutraBand{2, 1930, 600, 1199, 1850, 18600, all},
    EutraBand{3, 1805, 1200, 1949, 1710, 19200, all},
    EutraBand{4, 2110, 1950, 2399, 1710, 19950, all},
    EutraBand{5, 869, 2400, 2649, 824, 20400, to10},
    EutraBand{6, 875, 2650, 2749, 830, 20650, from5To10},
    EutraBand{7, 2620, 2750, 3449, 2500, 20750, from5},
    EutraBand{8, 925, 3450, 3799, 880, 21450, to10},
    EutraBand{9, 1844.9, 3800, 4149, 1749.9, 21800, from5},
    EutraBand{10, 2110, 4150, 4749, 1710, 22150, from5},
    EutraBand{11, 1475.9, 4750, 4949, 1427.9, 22750, from5To10},
    EutraBand{12, 729, 5010, 5179, 699, 23010, to10},
    EutraBand{13, 746, 5180, 5279, 777, 23180, from5To10},
    EutraBand{14, 758, 5280, 5379, 788, 23280, from5To10},
    EutraBand{17, 734, 5730, 5849, 704, 23730, from5To10},
    EutraBand{18, 860, 5850, 5999, 815, 23850, from5To15},
    EutraBand{19, 875, 6000, 6149, 830, 24000, from5To15},
    EutraBand{20, 791, 6150, 6449, 832, 24150, from5},
    EutraBand{21, 1495.9, 6450, 6599, 1447.9, 24450, from5To15},
    EutraBand{33, 1900, 36000, 36199, 1900, 36000, from5},
    EutraBand{34, 2010, 36200, 36349, 2010, 36200, from5To15},
    EutraBand{38, 2570, 37750, 38249, 2570, 37750, from5},
    EutraBand{39, 1880, 38250, 38649, 1880, 38250, from5},
    EutraBand{40, 2300, 38650, 39649, 2300, 38650, from5},
    EutraBand{41, 2496, 39650, 41589, 2496, 39650, from5},
};

}  // namespace

const EutraBand* eutraBandOf(std::uint16_t earfcn) {
  const auto band = std::ranges::find_if(bands, [earfcn](const EutraBand& candidate) {
    return candidate.firstDownlink <= earfcn && earfcn <= candidate.lastDownlink;
  });
  return band == bands.end() ? nullptr : &*band;
}

double downlinkMegahertz(std::uint16_t earfcn) {
  const EutraBand& band = *eutraBandOf(earfcn);
  return band.downlinkMegahertz + megahertzPerStep * (earfcn - band.firstDownlink);
}

double uplinkMegahertz(std::uint16_t earfcn) {
  const EutraBand& band = *eutraBandOf(earfcn);
  return band.uplinkMegahertz + megahertzPerStep * (earfcn - band.firstDownlink);
}

std::uint16_t uplinkEarfcn(std::uint16_t earfcn) {
  const EutraBand& band = *eutraBandOf(earfcn);
  return static_cast<std::uint16_t>(earfcn - band.firstDownlink + band.firstUplink);
}

double megahertzOfBlocks(std::uint8_t resourceBlocks) {
  const auto found = std::ranges::find(bandwidths, resourceBlocks, &Bandwidth::resourceBlocks);
  return found == bandwidths.end() ? 0 : found->megahertz;
}

bool allowsBandwidth(const EutraBand& band, std::uint8_t resourceBlocks) {
  const auto found = std::ranges::find(bandwidths, resourceBlocks, &Bandwidth::resourceBlocks);
  return found != bandwidths.end() && ((band.bandwidths >> (found - bandwidths.begin())) & 1) != 0;
}

}  // namespace kelvasi::sim
