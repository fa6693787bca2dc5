// SPDX-License-Identifier: Apache-2.0
#include "Survey/Cells/SeenCell.h"

#include <algorithm>

namespace kelvasi::survey {

namespace {

using Name = std::optional<std::int64_t> CellNames::*;
constexpr std::array<Name, 6> allNames{&CellNames::mcc,    &CellNames::mnc, &CellNames::area,
                                       &CellNames::cellId, &CellNames::sid, &CellNames::nid};

}  // namespace

bool CellNames::contradicts(const CellNames& other) const {
  return std::ranges::any_of(
      allNames, [&](Name name) { return this->*name && other.*name && this->*name != other.*name; });
}

void CellNames::learn(const CellNames& other) {
  for (const Name name : allNames) {
    if (other.*name) this->*name = other.*name;
  }
}

void CellLevel::add(Arrival time, double value) {
  ++count;
  minimum = count == 1 ? value : std::min(minimum, value);
  maximum = count == 1 ? value : std::max(maximum, value);
  mean += (value - mean) / static_cast<double>(count);
  last = value;
  lastTime = time;
}

void CellLevel::merge(const CellLevel& other) {
  if (other.count == 0) return;
  if (count == 0) {
    *this = other;
    return;
  }
  count += other.count;
  minimum = std::min(minimum, other.minimum);
  maximum = std::max(maximum, other.maximum);
  mean += (other.mean - mean) * static_cast<double>(other.count) / static_cast<double>(count);
  if (other.lastTime < lastTime) return;
  last = other.last;
  lastTime = other.lastTime;
}

const CellLevel* SeenCell::level(const Quantity& quantity) const {
  const auto found = std::ranges::find(levels(), &quantity, &CellLevel::quantity);
  return found == levels().end() ? nullptr : &*found;
}

CellLevel* SeenCell::levelFor(const Quantity& quantity) {
  for (std::size_t place = 0; place < used_; ++place) {
    if (levels_[place].quantity == &quantity) return &levels_[place];
  }
  if (used_ == levels_.size()) return nullptr;
  levels_[used_].quantity = &quantity;
  return &levels_[used_++];
}

void SeenCell::add(const Quantity& quantity, Arrival time, double value) {
  if (CellLevel* level = levelFor(quantity)) level->add(time, value);
}

void SeenCell::merge(const SeenCell& other) {
  names.learn(other.names);
  if (other.bandClass) bandClass = other.bandClass;
  roles.add(other.roles);
  if (other.last >= last) role = other.role;
  first = std::min(first, other.first);
  last = std::max(last, other.last);
  count += other.count;
  for (const CellLevel& each : other.levels()) {
    if (CellLevel* level = levelFor(*each.quantity)) level->merge(each);
  }
}

}  // namespace kelvasi::survey
