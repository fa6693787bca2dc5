// SPDX-License-Identifier: Apache-2.0
// The UMTS cells that a connection uses at once (3GPP TS 25.331, 14.1.2: events 1A, 1B and 1C), simplified.
#pragma once

#include <cstddef>
#include <optional>
#include <span>
#include <vector>

#include "Simulator/Radio/Cell.h"
#include "Simulator/Radio/RadioModel.h"

namespace kelvasi::sim::gsm {

class ActiveSet {
 public:
  static constexpr std::size_t largest = 3;

  // The cells outlive the set.
  explicit ActiveSet(std::span<const Cell> cells) : cells_(cells) {}

  // With the serving cell, where it is a UMTS cell; others belong to it in soft handover only.
  void update(std::optional<std::size_t> serving, const std::vector<Reception>& receptions,
              bool isSoftHandover);

  // Places of the cells, the serving one first.
  const std::vector<std::size_t>& cells() const { return members_; }
  bool contains(std::size_t cell) const;

 private:
  void keepGoodMembers(std::size_t serving, const std::vector<Reception>& receptions);
  void addNewMembers(std::size_t serving, const std::vector<Reception>& receptions);

  std::span<const Cell> cells_;
  std::vector<std::size_t> members_;
};

}  // namespace kelvasi::sim::gsm
