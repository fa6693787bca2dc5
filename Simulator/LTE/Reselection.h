// Which cell serves the handset: reselection by the priorities of layers, by rank within one (3GPP TS 36.304,
// 5.2.4), and handover, simplified.
#pragma once

#include <optional>
#include <span>
#include <vector>

#include "Simulator/LTE/Layers.h"

namespace kelvasi::sim::lte {

class Reselection {
 public:
  // The cells outlive it.
  explicit Reselection(std::span<const Cell> cells) : cells_(cells) {}

  // Looks at the receptions, `seconds` after the last time. A connection stays on LTE.
  void look(const std::vector<Reception>& receptions, bool isConnected, double seconds);

  // Its place among the cells; nothing without service.
  std::optional<std::size_t> serving() const { return serving_; }
  // The cell that is about to take the serving one's place; nothing while there is no better one.
  std::optional<std::size_t> candidate() const { return serving_ && pending_ ? pending_->to : std::nullopt; }

 private:
  // A change for which a reason has to last so long, seconds.
  struct Change {
    std::optional<std::size_t> to;
    double patience = 0;
  };

  std::optional<Change> wanted(const std::vector<Reception>& receptions, bool isConnected) const;
  std::optional<Change> reselection(const std::vector<Reception>& receptions) const;
  std::optional<Change> handover(const std::vector<Reception>& receptions) const;
  // The best suitable other cell, by priority and then by level, of those that `takes`.
  template <typename Takes>
  std::optional<std::size_t> best(const std::vector<Reception>& receptions, Takes takes) const;
  bool isPreferred(std::size_t cell, std::size_t other, const std::vector<Reception>& receptions) const;

  std::span<const Cell> cells_;
  std::optional<std::size_t> serving_;
  std::optional<Change> pending_;
  double pendingFor_ = 0;
};

}  // namespace kelvasi::sim::lte
