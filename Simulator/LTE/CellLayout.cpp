#include "Simulator/LTE/CellLayout.h"

#include "Simulator/Handset/CellLayout.h"
#include "Simulator/LTE/Layers.h"
#include "Simulator/Radio/EutraBand.h"

namespace kelvasi::sim::lte {

namespace {

constexpr std::uint16_t trackingAreaOffset = 4000;  // from the code of the location area
constexpr std::uint32_t firstENodeB = 0x1A4D0;
constexpr unsigned siteStep = 21;  // physical cell identities, seven of a layer
constexpr unsigned layerStep = 7;
constexpr unsigned firstIdentity = 5;
static_assert(firstIdentity + (siteCount - 1) * siteStep + 2 * layerStep < 504);

Cell lteCell(const Cell& neighbour, unsigned site, unsigned layer) {
  Cell cell;
  cell.technology = Technology::lte;
  cell.locationArea = neighbour.locationArea;
  cell.locationArea.code = static_cast<std::uint16_t>(neighbour.locationArea.code + trackingAreaOffset);
  cell.id = ((firstENodeB + site) << 8) | (layer + 1);
  cell.frequency = layers[layer].frequency;
  cell.megahertz = downlinkMegahertz(cell.frequency);
  cell.code = static_cast<std::uint16_t>(firstIdentity + site * siteStep + layer * layerStep);
  cell.site = neighbour.site;
  return cell;
}

}  // namespace

std::vector<Cell> layOutCells(Random random) {
  std::vector<Cell> cells = gsm::layOutCells(random.split());
  const std::vector<Cell> others = cells;
  unsigned site = 0;
  for (const Cell& other : others) {
    if (other.technology != Technology::gsm) continue;  // one of each site
    for (unsigned layer = 0; layer < layers.size(); ++layer) {
      if (layers[layer].technology == Technology::lte && random.happens(layers[layer].share))
        cells.push_back(lteCell(other, site, layer));
    }
    ++site;
  }
  return cells;
}

}  // namespace kelvasi::sim::lte
