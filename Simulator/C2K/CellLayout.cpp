// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/CellLayout.h"

#include <array>

#include "Simulator/Radio/Town.h"

namespace kelvasi::sim::c2k {

namespace {

constexpr std::array systems{System{.systemId = 4139, .networkId = 7, .colorCode = 21, .isHome = true},
                             System{.systemId = 4206, .networkId = 1, .colorCode = 48}};

constexpr std::uint16_t firstBaseId = 513;
constexpr std::uint16_t firstPilot = 4;
constexpr std::uint16_t pilotStep = 20;  // a multiple of PILOT_INC, which is 4
static_assert(firstPilot + pilotStep * (siteCount - 1) < 512);

}  // namespace

const System& systemOf(const Cell& cell) {
  return cell.locationArea.code == systems[0].systemId ? systems[0] : systems[1];
}

std::vector<Cell> layOutCells(Random random) {
  std::vector<Cell> cells;
  for (std::uint16_t number = 0; number < siteCount; ++number) {
    const int column = number / siteRows;
    const int row = number % siteRows;
    Cell cell;
    cell.technology = Technology::cdma;
    cell.locationArea.code = systems[column < siteColumns / 2 ? 0 : 1].systemId;
    cell.routingArea = static_cast<std::uint8_t>(row < siteRows / 2 ? 1 : 2);
    cell.id = firstBaseId + 16u * number;
    cell.frequency = oneXChannel;
    cell.megahertz = 878.49;  // 870 MHz and 283 steps of 30 kHz
    cell.code = static_cast<std::uint16_t>(firstPilot + pilotStep * number);
    cell.site = siteAt(column, row, random);
    cells.push_back(cell);
  }
  return cells;
}

}  // namespace kelvasi::sim::c2k
