#include "Simulator/Daemon/WorldCells.h"

#include <cmath>

namespace kelvasi::sim::gsm {

namespace {

int whole(double value) {
  return static_cast<int>(std::lround(value));
}

MeasuredCell measured(const World& world, std::size_t place) {
  MeasuredCell result{.cell = world.cell(place), .level = whole(world.reception(place).level), .ecNo = {}};
  if (result.cell.technology == Technology::umts) result.ecNo = whole(world.reception(place).ecNo);
  return result;
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
