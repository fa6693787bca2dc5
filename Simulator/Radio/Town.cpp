// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Radio/Town.h"

namespace kelvasi::sim {

namespace {

constexpr double jitter = 150;  // metres

double along(int number, int howMany, double edge) {
  return edge * (2 * (number + 0.5) / howMany - 1);
}

}  // namespace

Point siteAt(int column, int row, Random& random) {
  return {along(column, siteColumns, townEdge.x) + random.between(-jitter, jitter),
          along(row, siteRows, townEdge.y) + random.between(-jitter, jitter)};
}

}  // namespace kelvasi::sim
