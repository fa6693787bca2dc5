// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Daemon/WorldCells.h"

namespace kelvasi::sim::gsm {

namespace {

MeasuredCell measured(const World& world, std::size_t place) {
  return measuredCell(world.cell(place), world.reception(place));
}

}  // namespace

CellList cellListOf(const World& world) {
  CellList list;
  if (!world.serving()) return list;
  list.serving = measured(world, *world.serving());
  for (const std::size_t place : world.umtsNeighbours()) list.neighbours.push_back(measured(world, place));
  for (const std::size_t place : world.gsmNeighbours()) list.neighbours.push_back(measured(world, place));
  return list;
}

}  // namespace kelvasi::sim::gsm
