// SPDX-License-Identifier: Apache-2.0
// Which cell serves the handset: reselection by the priorities of layers, by rank within one (3GPP TS 36.304,
// 5.2.4), and handover, simplified.
#pragma once

#include <optional>
#include <span>
#include <vector>

#include "Simulator/LTE/Layers.h"
#include "Simulator/Radio/CellChange.h"

namespace kelvasi::sim::lte {

class Reselection {
 public:
  // The cells outlive it.
  explicit Reselection(std::span<const Cell> cells) : cells_(cells) {}

  // Looks at the receptions, `seconds` after the last time. A connection stays on LTE as long as that serves.
  void look(const std::vector<Reception>& receptions, bool isConnected, double seconds);

  // Its place among the cells; nothing without service.
  std::optional<std::size_t> serving() const { return serving_; }
  // The cell that is about to take the serving one's place; nothing while there is no better one.
  std::optional<std::size_t> candidate() const {
    return serving_ && timer_.pending() ? timer_.pending()->to : std::nullopt;
  }

 private:
  std::optional<CellChange> wanted(const std::vector<Reception>& receptions, bool isConnected) const;
  CellChange refuge(const std::vector<Reception>& receptions) const;
  std::optional<CellChange> reselection(const std::vector<Reception>& receptions) const;
  std::optional<CellChange> handover(const std::vector<Reception>& receptions) const;
  // The best suitable other cell, by priority and then by level, of those that `takes`.
  template <typename Takes>
  std::optional<std::size_t> best(const std::vector<Reception>& receptions, Takes takes) const;
  bool isPreferred(std::size_t cell, std::size_t other, const std::vector<Reception>& receptions) const;

  std::span<const Cell> cells_;
  std::optional<std::size_t> serving_;
  CellChangeTimer timer_;
};

}  // namespace kelvasi::sim::lte
