// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Chart/Chart.h"

#include <algorithm>

namespace kelvasi::cockpit {

namespace {

Arrival shareOf(std::chrono::nanoseconds length, double share) {
  return std::chrono::round<Arrival>(
      std::chrono::duration<double, std::nano>(static_cast<double>(length.count()) * share));
}

}  // namespace

bool Chart::add(const ChartLineKey& key) {
  if (lines_.size() == mostLines || std::ranges::find(lines_, key) != lines_.end()) return false;
  lines_.push_back(key);
  return true;
}

void Chart::setLength(std::chrono::nanoseconds length) {
  length_ = std::clamp(length, shortest, longest);
}

void Chart::zoom(double factor, double place, Arrival now) {
  const Arrival fixed = timeAt(place, now);
  const bool staysAtNow = follows() && place >= 1;
  setLength(shareOf(length_, factor));
  if (!staysAtNow) end_ = fixed + shareOf(length_, 1 - place);
  if (end_ && *end_ >= now) follow();
}

void Chart::pan(double share, Arrival now) {
  end_ = endAt(now) + shareOf(length_, share);
  if (*end_ >= now) follow();
}

void Chart::show(Arrival from, Arrival to) {
  setLength(to - from);
  end_ = to;
}

void Chart::keepTimeOf(const Chart& other) {
  length_ = other.length_;
  end_ = other.end_;
  cursors_ = other.cursors_;
}

Arrival Chart::timeAt(double place, Arrival now) const {
  return beginAt(now) + shareOf(length_, place);
}

}  // namespace kelvasi::cockpit
