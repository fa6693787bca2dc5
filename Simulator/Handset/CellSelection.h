// Which cell serves the handset: selection, reselection and handover (3GPP TS 25.304, 45.008), simplified.
#pragma once

#include <optional>
#include <span>
#include <vector>

#include "Simulator/Radio/Cell.h"
#include "Simulator/Radio/RadioModel.h"

namespace kelvasi::sim::gsm {

// The path-loss criterion C1 of a GSM cell, dB; below 0 the cell does not serve.
double criterionC1(const Reception& reception);
// C1 with the offset that cells broadcast, dB.
double criterionC2(const Reception& reception);
bool isSuitable(const Cell& cell, const Reception& reception);

class CellSelection {
 public:
  // The cells outlive the selection.
  explicit CellSelection(std::span<const Cell> cells) : cells_(cells) {}

  // Looks at the receptions, `seconds` after the last time. A connection is kept in its technology as long as
  // that serves at all.
  void look(const std::vector<Reception>& receptions, bool isConnected, double seconds);

  // Its place among the cells; nothing without service.
  std::optional<std::size_t> serving() const { return serving_; }

 private:
  // A change for which a reason has to last so long, seconds.
  struct Change {
    std::optional<std::size_t> to;
    double patience = 0;
  };

  std::optional<Change> wanted(const std::vector<Reception>& receptions, bool isConnected) const;
  std::optional<Change> fromUmts(const std::vector<Reception>& receptions, bool isConnected) const;
  std::optional<Change> fromGsm(const std::vector<Reception>& receptions, bool isConnected) const;
  std::optional<std::size_t> best(const std::vector<Reception>& receptions, Technology technology) const;
  std::optional<std::size_t> bestOfAll(const std::vector<Reception>& receptions) const;

  std::span<const Cell> cells_;
  std::optional<std::size_t> serving_;
  std::optional<Change> pending_;
  double pendingFor_ = 0;
};

}  // namespace kelvasi::sim::gsm
