// SPDX-License-Identifier: Apache-2.0
#include "Simulator/LTE/Layers.h"

#include <algorithm>

namespace kelvasi::sim::lte {

const Layer& layerOf(const Cell& cell) {
  return *std::ranges::find_if(layers, [&cell](const Layer& layer) {
    return layer.technology == cell.technology && (layer.frequency == 0 || layer.frequency == cell.frequency);
  });
}

double receiveLevelCriterion(const Cell& cell, const Reception& reception) {
  return reception.level - layerOf(cell).leastLevel;
}

bool isSuitable(const Cell& cell, const Reception& reception) {
  return receiveLevelCriterion(cell, reception) > 0 && reception.ecNo > layerOf(cell).leastEcNo;
}

}  // namespace kelvasi::sim::lte
