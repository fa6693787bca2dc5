#include "Simulator/UTRAN/CellLayout.h"

#include <array>

#include "Simulator/Handset/CellLayout.h"

namespace kelvasi::sim::utran {

namespace {

// 2011.0, 2012.6 and 2014.2 MHz, in band a; a UARFCN is five times the frequency in MHz.
constexpr std::array<std::uint16_t, 3> carriers{10055, 10063, 10071};
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
    cell.frequency = carriers[number % carriers.size()];
    cell.code = static_cast<std::uint16_t>(firstParameter + number * parameterStep);
    ++number;
  }
  return cells;
}

}  // namespace kelvasi::sim::utran
