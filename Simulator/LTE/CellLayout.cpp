// SPDX-License-Identifier: Apache-2.0
#include "Simulator/LTE/CellLayout.h"

#include <map>

#include "Radio/Channels.h"
#include "Simulator/Handset/CellLayout.h"
#include "Simulator/LTE/Layers.h"

namespace kelvasi::sim::lte {

namespace {

constexpr std::uint16_t trackingAreaOffset = 4000;  // from the code of the location area
constexpr std::uint32_t firstENodeB = 0x1A4D0;

// Physical cell identities: of the group any, modulo 3 another one than at the sites to all four sides, so
// that their synchronisation signals differ (3GPP TS 36.211, 6.11).
constexpr unsigned siteStep = 7;
constexpr unsigned layerStep = 2;
constexpr unsigned layersOfNetwork = 3;
constexpr unsigned groups = 168;
static_assert((siteCount - 1) * siteStep + (layersOfNetwork - 1) * layerStep < groups);

std::uint16_t identityOf(unsigned site, unsigned layer) {
  const unsigned group = site * siteStep + layer % layersOfNetwork * layerStep;
  return static_cast<std::uint16_t>(3 * group + (site / siteRows + site % siteRows) % 3);
}

Cell lteCell(const Cell& neighbour, unsigned site, unsigned layer) {
  Cell cell;
  cell.technology = Technology::lte;
  cell.locationArea = neighbour.locationArea;
  cell.locationArea.code = static_cast<std::uint16_t>(neighbour.locationArea.code + trackingAreaOffset);
  cell.id = ((firstENodeB + site) << 8) | (layer % layersOfNetwork + 1);
  cell.frequency = layers[layer].frequency;
  cell.megahertz = eutraCarriers(cell.frequency)[0].downlink.megahertz();
  cell.code = identityOf(site, layer);
  cell.site = neighbour.site;
  return cell;
}

// The first sites of a network have all of its layers: no carrier is without neighbours.
constexpr int fullSites = 3;

bool isOf(const Layer& layer, const Cell& site) {
  return layer.technology == Technology::lte && layer.network == site.locationArea.plmn;
}

}  // namespace

std::vector<Cell> layOutCells(Random random) {
  std::vector<Cell> cells = gsm::layOutCells(random.split());
  const std::vector<Cell> others = cells;
  unsigned site = 0;
  std::map<std::uint16_t, int> cellsOfCarrier;
  for (const Cell& other : others) {
    if (other.technology != Technology::gsm) continue;  // one of each site
    for (unsigned layer = 0; layer < layers.size(); ++layer) {
      if (!isOf(layers[layer], other)) continue;
      int& sofar = cellsOfCarrier[layers[layer].frequency];
      if (sofar >= fullSites && !random.happens(layers[layer].share)) continue;
      ++sofar;
      cells.push_back(lteCell(other, site, layer));
    }
    ++site;
  }
  return cells;
}

}  // namespace kelvasi::sim::lte
