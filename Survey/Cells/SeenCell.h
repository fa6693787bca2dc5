// SPDX-License-Identifier: Apache-2.0
// What a drive has told of one cell.
#pragma once

#include <array>
#include <chrono>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

#include "LogGenerator/Arrival.h"
#include "LogGenerator/Reading.h"
#include "Radio/CellIdentity.h"
#include "Radio/Quantity.h"

namespace kelvasi::survey {

// What networks call the cell; the records of a serving cell tell it.
struct CellNames {
  std::optional<std::int64_t> mcc;
  std::optional<std::int64_t> mnc;
  std::optional<std::int64_t> area;    // location or tracking area
  std::optional<std::int64_t> cellId;  // in CDMA the base station's
  std::optional<std::int64_t> sid;
  std::optional<std::int64_t> nid;

  // Whether a part that both know differs.
  bool contradicts(const CellNames& other) const;
  // Takes over what the other knows.
  void learn(const CellNames& other);
  bool operator==(const CellNames&) const = default;
};

// All values of one quantity.
struct CellLevel {
  const Quantity* quantity = nullptr;
  double minimum = 0;
  double maximum = 0;
  double mean = 0;
  double last = 0;
  std::uint64_t count = 0;
  Arrival lastTime{0};

  void add(Arrival time, double value);
  void merge(const CellLevel& other);
};

class RoleSet {
 public:
  void add(CellRole role) { bits_ |= bitOf(role); }
  void add(RoleSet others) { bits_ |= others.bits_; }
  bool has(CellRole role) const { return (bits_ & bitOf(role)) != 0; }
  bool operator==(const RoleSet&) const = default;

 private:
  static constexpr std::uint32_t bitOf(CellRole role) {
    return role == CellRole::none ? 0 : 1U << static_cast<unsigned>(role);
  }
  std::uint32_t bits_ = 0;
};

struct SeenCell {
  static constexpr std::size_t mostLevels = 12;

  std::uint32_t number = 0;  // of this record, never given again
  CellIdentity identity;
  CellNames names;
  std::optional<std::int64_t> bandClass = {};  // of CDMA, where a record said it
  RoleSet roles;                               // all that it ever had
  CellRole role = CellRole::none;              // the one it was named in last
  Arrival first{0};                            // when a message first spoke of it
  Arrival last{0};
  std::uint64_t count = 0;  // messages that spoke of it

  std::span<const CellLevel> levels() const { return {levels_.data(), used_}; }
  const CellLevel* level(const Quantity& quantity) const;
  // A quantity past the most that a cell has room for is left out.
  void add(const Quantity& quantity, Arrival time, double value);
  // Another record of the same cell.
  void merge(const SeenCell& other);

 private:
  CellLevel* levelFor(const Quantity& quantity);

  std::array<CellLevel, mostLevels> levels_;
  std::size_t used_ = 0;
};

}  // namespace kelvasi::survey
