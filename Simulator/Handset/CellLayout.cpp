// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Handset/CellLayout.h"

namespace kelvasi::sim::gsm {

namespace {

constexpr double shareWithUmts = 0.75;

// From west to east, two columns each.
constexpr std::array areas{LocationArea{homePlmn, 4101}, LocationArea{homePlmn, 4102},
                           LocationArea{partnerPlmn, 517}};
constexpr LocationArea forbiddenArea{homePlmn, 4199};

constexpr std::uint16_t firstArfcn = 12;
constexpr std::uint16_t arfcnStep = 4;  // a cell's own BCCH and the three that it hops over
constexpr std::uint32_t homeRnc = 0x2A5;
constexpr std::uint32_t partnerRnc = 0x3C1;
constexpr std::uint16_t firstCellId = 21001;
constexpr std::uint16_t scramblingCodeStep = 16;

Cell emptySite(int column, int row, Random& random) {
  Cell cell;
  cell.site = siteAt(column, row, random);
  cell.isForbidden = column == siteColumns - 1 && row == siteRows - 1;
  cell.locationArea = cell.isForbidden ? forbiddenArea : areas[static_cast<std::size_t>(column / 2)];
  cell.routingArea = static_cast<std::uint8_t>(row < siteRows / 2 ? 1 : 2);
  return cell;
}

Cell gsmCell(Cell site, std::uint16_t number) {
  site.technology = Technology::gsm;
  site.megahertz = 900;
  site.id = firstCellId + number;
  site.frequency = static_cast<std::uint16_t>(firstArfcn + number * arfcnStep);
  site.code = static_cast<std::uint16_t>(number % 64);
  return site;
}

Cell umtsCell(Cell site, std::uint16_t number) {
  site.technology = Technology::umts;
  site.megahertz = 2000;
  const Plmn network = site.locationArea.plmn;
  site.id = ((network == homePlmn ? homeRnc : partnerRnc) << 16) | (firstCellId + 500u + number);
  site.frequency = umtsFrequencyOf(network);
  site.code = static_cast<std::uint16_t>(number * scramblingCodeStep);
  site.hasTwoCarriers = number % 3 == 0;
  return site;
}

}  // namespace

std::vector<Cell> layOutCells(Random random) {
  std::vector<Cell> cells;
  for (std::uint16_t number = 0; number < siteCount; ++number) {
    const Cell site = emptySite(number / siteRows, number % siteRows, random);
    cells.push_back(gsmCell(site, number));
    if (random.happens(shareWithUmts)) cells.push_back(umtsCell(site, number));
  }
  return cells;
}

std::array<std::uint16_t, 3> hoppingFrequencies(const Cell& cell) {
  const auto next = [&](int step) { return static_cast<std::uint16_t>(cell.frequency + step); };
  return {next(1), next(2), next(3)};
}

}  // namespace kelvasi::sim::gsm
