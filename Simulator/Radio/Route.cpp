// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Radio/Route.h"

#include <cmath>
#include <numbers>

#include "Simulator/Radio/Town.h"

namespace kelvasi::sim {

namespace {

constexpr int cornerCount = 14;
constexpr double innermost = 0.35;  // of the way from the town's middle to its edge
constexpr double outermost = 0.95;

constexpr double slowest = 6;  // metres a second
constexpr double fastest = 18;
constexpr double shareOfStops = 0.5;
constexpr double longestStop = 20;  // seconds

}  // namespace

double distance(Point from, Point to) {
  return std::hypot(to.x - from.x, to.y - from.y);
}

Route::Route(Random random) : random_(random) {
  for (int corner = 0; corner < cornerCount; ++corner) {
    const double angle = 2 * std::numbers::pi * corner / cornerCount;
    const double out = random_.between(innermost, outermost);
    corners_.push_back({townEdge.x * out * std::cos(angle), townEdge.y * out * std::sin(angle)});
  }
  position_ = corners_.front();
  speed_ = random_.between(slowest, fastest);
}

void Route::drive(double seconds) {
  untilGo_ -= seconds;
  if (isStopped()) return;
  const Point corner = corners_[next_];
  const double left = distance(position_, corner);
  const double way = speed_ * seconds;
  if (way >= left) return reachCorner();
  position_.x += (corner.x - position_.x) * way / left;
  position_.y += (corner.y - position_.y) * way / left;
}

double Route::speedTowards(Point place) const {
  const Point ahead = corners_[next_];
  const double product = distance(position_, ahead) * distance(position_, place);
  if (isStopped() || product == 0) return 0;
  const double cosine = ((ahead.x - position_.x) * (place.x - position_.x) +
                         (ahead.y - position_.y) * (place.y - position_.y)) /
                        product;
  return speed_ * cosine;
}

void Route::reachCorner() {
  position_ = corners_[next_];
  next_ = (next_ + 1) % corners_.size();
  speed_ = random_.between(slowest, fastest);
  if (random_.happens(shareOfStops)) untilGo_ = random_.between(1, longestStop);
}

}  // namespace kelvasi::sim
