// SPDX-License-Identifier: Apache-2.0
#include "Simulator/UTRAN/CellLayout.h"

#include <array>

#include "Simulator/Handset/CellLayout.h"

namespace kelvasi::sim::utran {

namespace {

// 2011.0, 2012.6 and 2014.2 MHz at home and 2015.8, 2017.4 and 2019.0 MHz of the partner, in band a; a UARFCN
// is five times the frequency in MHz.
using Carriers = std::array<std::uint16_t, 3>;
constexpr Carriers homeCarriers{10055, 10063, 10071};
constexpr Carriers partnerCarriers{10079, 10087, 10095};
constexpr std::uint16_t firstParameter = 4;
constexpr std::uint16_t parameterStep = 5;  // cell parameters are 0 to 127
static_assert(firstParameter + (siteCount - 1) * parameterStep < 128);

}  // namespace

std::vector<Cell> layOutCells(Random random) {
  std::vector<Cell> cells = gsm::layOutCells(random);
  std::uint16_t number = 0;
  for (Cell& cell : cells) {
    if (cell.technology != Technology::umts) continue;
    cell.isTdd = true;
    cell.hasTwoCarriers = false;
    const Carriers& carriers = cell.locationArea.plmn == homePlmn ? homeCarriers : partnerCarriers;
    cell.frequency = carriers[number % carriers.size()];
    cell.code = static_cast<std::uint16_t>(firstParameter + number * parameterStep);
    ++number;
  }
  return cells;
}

}  // namespace kelvasi::sim::utran
