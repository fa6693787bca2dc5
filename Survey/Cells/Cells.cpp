// SPDX-License-Identifier: Apache-2.0
#include "Survey/Cells/Cells.h"

#include <algorithm>
#include <array>
#include <utility>

#include "Survey/Cells/OneOfSeveral.h"

namespace kelvasi::survey {

namespace {

struct NameQuantity {
  const Quantity* quantity;
  std::optional<std::int64_t> CellNames::*name;
};
constexpr std::array nameQuantities{
    NameQuantity{&quantity::mcc, &CellNames::mcc},       NameQuantity{&quantity::mnc, &CellNames::mnc},
    NameQuantity{&quantity::lac, &CellNames::area},      NameQuantity{&quantity::tac, &CellNames::area},
    NameQuantity{&quantity::cellId, &CellNames::cellId}, NameQuantity{&quantity::baseId, &CellNames::cellId},
    NameQuantity{&quantity::sid, &CellNames::sid},       NameQuantity{&quantity::nid, &CellNames::nid}};

constexpr bool isCdma(const CellIdentity& cell) {
  return cell.family == RadioFamily::cdma || cell.family == RadioFamily::evdo;
}

const NameQuantity* nameQuantityOf(const Quantity* quantity) {
  const auto found = std::ranges::find(nameQuantities, quantity, &NameQuantity::quantity);
  return found == nameQuantities.end() ? nullptr : &*found;
}

// The sections of CDMA hold all sorts of rows; there a row itself tells: a pilot of the active set by its
// Ec/Io, the serving cell by its channel or PN offset.
CellRole roleOf(const Reading& reading, const Quantity& quantity) {
  const CellRole role = reading.section ? reading.section->role : CellRole::none;
  if (role != CellRole::none || !isCdma(reading.cell)) return role;
  if (&quantity == &quantity::ecio) return CellRole::active;
  return quantity.kind == QuantityKind::identity ? CellRole::serving : CellRole::none;
}

// Whether the reading says which cell serves: it is the channel, the code or the name of that cell.
bool namesServingCell(const Reading& reading, const Quantity& quantity, double number) {
  if (!reading.cell || roleOf(reading, quantity) != CellRole::serving) return false;
  const auto whole = static_cast<std::int64_t>(number);
  return whole == reading.cell.channel || whole == reading.cell.code || &quantity == &quantity::cellId;
}

// 1x and EV-DO serve side by side.
std::size_t airInterfaceOf(RadioFamily family) {
  if (family == RadioFamily::cdma) return 1;
  return family == RadioFamily::evdo ? 2 : 0;
}

}  // namespace

Cells::Cells(OnMeasured onMeasured, OnServing onServing, std::size_t most)
    : onMeasured_(std::move(onMeasured)), onServing_(std::move(onServing)), most_(most) {
  cells_.reserve(most);
  mentioned_.reserve(most);
  index_.reserve(most);
}

void Cells::take(const Readings& readings) {
  ++message_;
  lastAsked_ = {};
  bandClasses_.take(readings);
  const Naming naming = namingIn(readings);
  if (naming.cell) learn(naming, readings.arrival());
  for (const Reading& reading : readings.all()) measure(reading, readings.arrival());
}

// Names come from one message as a whole: those of the last one may be another cell's.
Cells::Naming Cells::namingIn(const Readings& readings) {
  Naming naming;
  for (const Reading& reading : readings.all()) {
    const Quantity* quantity = quantityOf(reading);
    if (!quantity || quantity->kind != QuantityKind::identity || isOneOfSeveral(reading)) continue;
    const auto number = numberOf(reading);
    if (!number || *number < 0) continue;
    if (namesServingCell(reading, *quantity, *number)) naming.cell = reading.cell;
    if (const NameQuantity* name = nameQuantityOf(quantity))
      naming.names.*(name->name) = static_cast<std::int64_t>(*number);
  }
  return naming;
}

void Cells::learn(const Naming& naming, Arrival time) {
  std::size_t cell = cellFor(naming.cell, time);
  if (cells_[cell].names.contradicts(naming.names)) {
    cell = add(naming.cell, time);
    lastAsked_ = {};
  }
  cells_[cell].names.learn(naming.names);
  mention(cell, CellRole::serving, time);
  serve(cell, time);
}

void Cells::serve(std::size_t cell, Arrival time) {
  const SeenCell& now = cells_[cell];
  lastServing_ = airInterfaceOf(now.identity.family);
  Serving& serving = servings_[lastServing_];
  const SeenCell* before = cellOf(serving);
  serving = {cell, now.number, time};
  if (before == &now) return;
  // The same cell, of which more or less was said.
  const bool areWhole = before && before->identity.isWhole() && now.identity.isWhole();
  if (before && !areWhole && canBeSame(before->identity, now.identity)) return;
  if (onServing_) onServing_(before, now, time);
}

void Cells::measure(const Reading& reading, Arrival time) {
  const Quantity* quantity = quantityOf(reading);
  if (!quantity) return;
  std::optional<std::size_t> cell;
  if (reading.cell) {
    cell = cellFor(reading.cell, time);
    mention(*cell, roleOf(reading, *quantity), time);
  }
  if (quantity->kind != QuantityKind::measurement) return;
  const auto number = numberOf(reading);
  if (!number) return;
  if (cell) cells_[*cell].add(*quantity, time, *number);
  if (onMeasured_) onMeasured_(cell ? &cells_[*cell] : nullptr, reading, *number);
}

void Cells::mention(std::size_t cell, CellRole role, Arrival time) {
  SeenCell& seen = cells_[cell];
  // Lists of neighbours may hold the serving cell too.
  if (role == CellRole::neighbour && isServing(seen)) role = CellRole::serving;
  if (role != CellRole::none) seen.role = role;
  seen.roles.add(role);
  if (isCdma(seen.identity)) seen.bandClass = bandClasses_.of(seen.identity.channel);
  seen.last = std::max(seen.last, time);
  seen.first = std::min(seen.first, time);
  if (std::exchange(mentioned_[cell], message_) != message_) ++seen.count;
}

const SeenCell* Cells::serving() const {
  return cellOf(servings_[lastServing_]);
}

const SeenCell* Cells::serving(RadioFamily family) const {
  return cellOf(servings_[airInterfaceOf(family)]);
}

bool Cells::isServing(const SeenCell& cell) const {
  return std::ranges::any_of(servings_,
                             [&](const Serving& serving) { return serving.number == cell.number; });
}

const SeenCell* Cells::cellOf(const Serving& serving) const {
  if (serving.number == 0 || cells_[serving.cell].number != serving.number) return nullptr;
  return &cells_[serving.cell];
}

const SeenCell* Cells::find(std::uint32_t number) const {
  const auto found = std::ranges::find(cells_, number, &SeenCell::number);
  return found == cells_.end() ? nullptr : &*found;
}

std::size_t Cells::cellFor(const CellIdentity& identity, Arrival time) {
  if (!lastAsked_ || lastAsked_ != identity) {
    lastFound_ = lookFor(identity, time);
    lastAsked_ = identity;
  }
  return lastFound_;
}

std::size_t Cells::lookFor(const CellIdentity& identity, Arrival time) {
  if (identity.isWhole()) {
    if (const auto cell = known(identity)) return *cell;
    if (const auto cell = onlyPart(identity, time)) {
      setIdentity(*cell, identity);
      return *cell;
    }
  } else {
    if (const auto cell = onlyWhole(identity, time)) return *cell;
    if (const auto cell = known(identity)) return *cell;
  }
  return add(identity, time);
}

std::vector<Cells::Place>::iterator Cells::placeOf(const CellIdentity& identity) {
  return std::ranges::lower_bound(index_, identity, {}, &Place::identity);
}

std::optional<std::size_t> Cells::known(const CellIdentity& identity) {
  const auto place = placeOf(identity);
  if (place == index_.end() || place->identity != identity) return std::nullopt;
  return place->cell;
}

bool Cells::isFresh(std::size_t cell, Arrival time) const {
  return cells_[cell].last <= time && time - cells_[cell].last <= freshness;
}

// Of those that were heard of lately.
std::optional<std::size_t> Cells::onlyWhole(const CellIdentity& part, Arrival time) const {
  std::optional<std::size_t> only;
  for (const Place& place : index_) {
    if (!place.identity.isWhole() || !canBeSame(place.identity, part) || !isFresh(place.cell, time)) continue;
    if (only) return std::nullopt;
    only = place.cell;
  }
  return only;
}

// A record that is no older than that: nothing in it can be another cell's.
std::optional<std::size_t> Cells::onlyPart(const CellIdentity& whole, Arrival time) const {
  std::optional<std::size_t> only;
  for (const Place& place : index_) {
    if (place.identity.isWhole() || !canBeSame(place.identity, whole)) continue;
    if (!isFresh(place.cell, time) || time - cells_[place.cell].first > freshness) continue;
    if (only) return std::nullopt;
    only = place.cell;
  }
  return only;
}

std::size_t Cells::add(const CellIdentity& identity, Arrival time) {
  const std::size_t cell = room();
  cells_[cell] = SeenCell();
  cells_[cell].number = ++lastNumber_;
  cells_[cell].first = time;
  cells_[cell].last = time;
  mentioned_[cell] = 0;
  setIdentity(cell, identity);
  return cell;
}

void Cells::setIdentity(std::size_t cell, const CellIdentity& identity) {
  std::erase_if(index_, [&](const Place& each) { return each.cell == cell; });
  cells_[cell].identity = identity;
  const auto place = placeOf(identity);
  if (place != index_.end() && place->identity == identity) {
    place->cell = cell;
  } else {
    index_.insert(place, {identity, cell});
  }
}

std::size_t Cells::room() {
  if (cells_.size() < most_) {
    cells_.emplace_back();
    mentioned_.push_back(0);
    return cells_.size() - 1;
  }
  const auto oldest = std::ranges::min_element(cells_, {}, &SeenCell::last);
  const auto cell = static_cast<std::size_t>(oldest - cells_.begin());
  std::erase_if(index_, [&](const Place& each) { return each.cell == cell; });
  ++dropped_;
  return cell;
}

void Cells::takeServing(const Cells& other, const SeenCell& there, std::size_t here) {
  for (std::size_t at = 0; at < servings_.size(); ++at) {
    const Serving& serving = other.servings_[at];
    if (serving.number != there.number || (servings_[at].number != 0 && serving.time < servings_[at].time))
      continue;
    servings_[at] = {here, cells_[here].number, serving.time};
    if (serving.time >= servings_[lastServing_].time) lastServing_ = at;
  }
}

std::optional<std::size_t> Cells::sameAs(const SeenCell& other) const {
  for (std::size_t cell = 0; cell < cells_.size(); ++cell) {
    if (cells_[cell].identity == other.identity && !cells_[cell].names.contradicts(other.names)) return cell;
  }
  return std::nullopt;
}

void Cells::merge(const Cells& other, const OnMerged& onMerged) {
  for (const SeenCell& there : other.cells_) {
    const auto same = sameAs(there);
    const std::size_t cell = same ? *same : add(there.identity, there.first);
    cells_[cell].merge(there);
    if (onMerged) onMerged(there.number, cells_[cell].number);
    takeServing(other, there, cell);
  }
  dropped_ += other.dropped_;
}

}  // namespace kelvasi::survey
