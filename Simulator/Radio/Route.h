// SPDX-License-Identifier: Apache-2.0
// The way of a handset through the town: a closed route, driven with stops.
#pragma once

#include <cstddef>
#include <vector>

#include "Simulator/Radio/Cell.h"
#include "Simulator/Random.h"

namespace kelvasi::sim {

double distance(Point from, Point to);  // metres

class Route {
 public:
  explicit Route(Random random);

  void drive(double seconds);
  Point position() const { return position_; }
  // Metres a second; negative away from it.
  double speedTowards(Point place) const;
  const std::vector<Point>& corners() const { return corners_; }

 private:
  bool isStopped() const { return untilGo_ > 0; }
  void reachCorner();

  Random random_;
  std::vector<Point> corners_;
  std::size_t next_ = 1;  // the corner ahead
  Point position_;
  double speed_ = 0;
  double untilGo_ = 0;  // seconds of a stop that are left
};

}  // namespace kelvasi::sim
